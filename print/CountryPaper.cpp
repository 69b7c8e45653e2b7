#include "CountryPaper.h"

#include <QLocale>

namespace kareport
{

PaperSize paperOfCountry(const QLocale &locale)
{
    switch (locale.territory()) {
    case QLocale::Belize:
    case QLocale::Canada:
    case QLocale::Chile:
    case QLocale::Colombia:
    case QLocale::CostaRica:
    case QLocale::DominicanRepublic:
    case QLocale::ElSalvador:
    case QLocale::Guatemala:
    case QLocale::Mexico:
    case QLocale::Nicaragua:
    case QLocale::Panama:
    case QLocale::Philippines:
    case QLocale::PuertoRico:
    case QLocale::UnitedStates:
    case QLocale::Venezuela: return PaperSize::Letter;
    default: return PaperSize::A4;
    }
}

bool measuresInInches(const QLocale &locale)
{
    return locale.measurementSystem() == QLocale::ImperialUSSystem;
}

} // namespace kareport
