// Angles as files write them.
#include "LandXmlUnits.h"
#include "NumberText.h"

#include <algorithm>
#include <cmath>
#include <numbers>
#include <string>

namespace kareport
{

namespace
{

/// Two digits of a fraction, as a number. Missing ones are zeros.
double twoDigits(std::string_view fraction, std::size_t at)
{
    const auto digit = [&](std::size_t place) { return place < fraction.size() ? fraction[place] - '0' : 0; };
    return 10 * digit(at) + digit(at + 1);
}

/// 45.30155 is 45 degrees, 30 minutes and 15.5 seconds; so is 45.30.155.
bool parseDegreesMinutesSeconds(std::string_view text, double &degrees)
{
    const bool isNegative = !text.empty() && text.front() == '-';
    if (!text.empty() && (isNegative || text.front() == '+')) {
        text.remove_prefix(1);
    }
    const std::size_t point = std::min(text.find('.'), text.size());
    const std::string_view whole = text.substr(0, point);
    std::string fraction(text.substr(std::min(point + 1, text.size())));
    if (fraction.size() > 2 && fraction[2] == '.') {
        fraction.erase(2, 1);
    }
    const auto isDigits = [](std::string_view digits) {
        return digits.find_first_not_of("0123456789") == std::string_view::npos;
    };
    double number = 0;
    if (whole.empty() || !isDigits(whole) || !isDigits(fraction) || !parseNumber(whole, number)) {
        return false;
    }
    const double minutes = twoDigits(fraction, 0);
    double seconds = twoDigits(fraction, 2);
    if (fraction.size() > 4) {
        double rest = 0;
        parseNumber("0." + fraction.substr(4), rest);
        seconds += rest;
    }
    if (minutes >= 60 || seconds >= 60) {
        return false;
    }
    degrees = (number + minutes / 60 + seconds / 3600) * (isNegative ? -1 : 1);
    return true;
}

/// 45.301550 of 45 degrees, 30 minutes and 15.5 seconds.
QString degreesMinutesSeconds(double radians)
{
    constexpr qint64 circle = qint64(360) * 3600 * 100;
    const double degrees = std::fabs(radians) * 180 / std::numbers::pi;
    const qint64 hundredths = std::llround(degrees * 3600 * 100) % circle;
    const QString text = QStringLiteral("%1.%2%3%4")
                             .arg(hundredths / 360000)
                             .arg(hundredths / 6000 % 60, 2, 10, QLatin1Char('0'))
                             .arg(hundredths / 100 % 60, 2, 10, QLatin1Char('0'))
                             .arg(hundredths % 100, 2, 10, QLatin1Char('0'));
    return radians < 0 ? u'-' + text : text;
}

} // namespace

bool parseLandXmlAngle(std::string_view text, LandXmlAngle form, double &radians)
{
    double number = 0;
    const bool isAngle = form == LandXmlAngle::DegreesMinutesSeconds ? parseDegreesMinutesSeconds(text, number)
                                                                     : parseNumber(text, number);
    switch (form) {
    case LandXmlAngle::Radians: radians = number; break;
    case LandXmlAngle::Grads: radians = number * std::numbers::pi / 200; break;
    case LandXmlAngle::Degrees:
    case LandXmlAngle::DegreesMinutesSeconds: radians = number * std::numbers::pi / 180; break;
    }
    return isAngle && std::isfinite(radians);
}

QString landXmlAngleText(double radians, LandXmlAngle form)
{
    switch (form) {
    case LandXmlAngle::Radians: return QString::number(radians, 'f', 7);
    case LandXmlAngle::Grads: return QString::number(radians * 200 / std::numbers::pi, 'f', 5);
    case LandXmlAngle::Degrees: return QString::number(radians * 180 / std::numbers::pi, 'f', 5);
    case LandXmlAngle::DegreesMinutesSeconds: break;
    }
    return degreesMinutesSeconds(radians);
}

} // namespace kareport
