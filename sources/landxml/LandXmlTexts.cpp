#include "LandXmlTexts.h"

#include "BearingText.h"
#include "FixedNotation.h"
#include "TextBuffer.h"
#include "VariableType.h"

#include <cmath>

namespace kareport
{

namespace
{

QString numberText(double number, const UJobSettings &settings)
{
    const FixedNotation notation(number, settings.numberDecimals);
    const std::string_view digits = notation.digits();
    const QString text = QString::fromLatin1(digits.data(), static_cast<qsizetype>(digits.size()));
    return number < 0 && !notation.isZero() ? u'-' + text : text;
}

QString lengthText(double shown, const UJobSettings &settings)
{
    TextBuffer text;
    settings.appendUnitLength(text, shown, {});
    return text.view().toString();
}

QString stationText(double shown, const UJobSettings &settings)
{
    TextBuffer text;
    settings.appendStation(text, shown, {.alignRight = true, .showSign = true});
    return text.view().toString();
}

QString offsetText(double shown, const UJobSettings &settings)
{
    const QString text = lengthText(std::fabs(shown), settings);
    return shown < 0 ? text + u'L' : shown > 0 ? text + u'R' : text;
}

} // namespace

std::optional<QString> landXmlText(double value, int type, const UJobSettings &settings)
{
    const double shown = settings.ConvertToDisplay(value, type, 0);
    const bool isInfinite = std::isinf(value);
    const QString infinite = value < 0 ? QStringLiteral("-INF") : QStringLiteral("INF");
    switch (type) {
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_COORDINATE:
    case VARIABLE_ELEVATION: return isInfinite ? infinite : lengthText(shown, settings);
    case VARIABLE_STATION: return isInfinite ? infinite : stationText(shown, settings);
    case VARIABLE_OFFSET: return isInfinite ? infinite : offsetText(shown, settings);
    case VARIABLE_AREA:
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: return isInfinite ? infinite : numberText(shown, settings);
    case VARIABLE_BEARING: return isInfinite ? infinite : bearingText(shown, settings);
    default: return std::nullopt;
    }
}

} // namespace kareport
