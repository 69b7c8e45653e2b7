#include "CountryPaper.h"

#include <QLocale>

#include <gtest/gtest.h>

namespace
{

using kareport::PaperSize;

TEST(CountryPaper, IsWhatPrintersOfTheCountryHold)
{
    struct Row
    {
        QLocale::Language language;
        QLocale::Territory territory;
        PaperSize paper;
        bool inches;
        const char *reason;
    };
    const Row rows[] = {
        {QLocale::English, QLocale::UnitedStates, PaperSize::Letter, true, "Letter and inches"},
        {QLocale::French, QLocale::Canada, PaperSize::Letter, false, "Letter, but metres"},
        {QLocale::Spanish, QLocale::Mexico, PaperSize::Letter, false, "Letter, but metres"},
        {QLocale::German, QLocale::Germany, PaperSize::A4, false, "A4"},
        {QLocale::Japanese, QLocale::Japan, PaperSize::A4, false, "A4"},
        {QLocale::English, QLocale::UnitedKingdom, PaperSize::A4, false, "miles on the road, millimetres on paper"},
        {QLocale::C, QLocale::AnyTerritory, PaperSize::A4, false, "no country"},
    };
    for (const Row &row : rows) {
        const QLocale locale(row.language, row.territory);
        EXPECT_EQ(kareport::paperOfCountry(locale), row.paper) << row.reason;
        EXPECT_EQ(kareport::measuresInInches(locale), row.inches) << row.reason;
    }
}

} // namespace
