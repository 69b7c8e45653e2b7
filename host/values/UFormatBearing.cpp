#include "UFormatBearing.h"

#include <cmath>
#include <numbers>

namespace
{

enum Unit : unsigned
{
    unitDms = 0,
    unitGon = 2
};

qint64 powerOfTen(qint32 exponent)
{
    qint64 power = 1;
    for (qint32 i = 0; i < exponent; ++i) {
        power *= 10;
    }
    return power;
}

void appendPadded(QString &text, qint64 number, int digits)
{
    const QString written = QString::number(number);
    text.append(QString(qMax<qsizetype>(digits - written.size(), 0), u'0'));
    text.append(written);
}

} // namespace

void UFormatBearing::ConvertToDisplayString(double value, QString &text) const
{
    text.clear();
    if (!std::isfinite(value)) {
        return;
    }
    if (reference_ == 1) {
        value += std::numbers::pi;
    }
    const bool gon = unit_ == unitGon;
    const double circle = gon ? 400.0 : 360.0;
    value *= gon ? 200.0 / std::numbers::pi : 180.0 / std::numbers::pi;
    if (!std::isfinite(value)) {
        return;
    }
    double angle = std::fmod(value, circle);
    if (angle < 0) {
        angle += circle;
    }

    // From here on everything is counted in the smallest unit shown, so that rounding can never show 60 seconds.
    const qint64 unitsPerWhole = (unit_ == unitDms ? 3600 : 1) * powerOfTen(decimals_);
    double scaled = angle;
    if (unit_ == unitDms) {
        scaled *= 3600.0;
    }
    scaled *= static_cast<double>(powerOfTen(decimals_));
    const double whole = std::floor(scaled);
    qint64 count = static_cast<qint64>(whole) + (scaled - whole >= 0.5 ? 1 : 0);
    const qint64 quarter = (gon ? 100 : 90) * unitsPerWhole;
    if (count >= 4 * quarter) {
        count = 0;
    }

    if (style_ != 1) {
        appendAngle(text, count);
        return;
    }
    struct Quadrant
    {
        char16_t first;
        qint64 angle;
        char16_t last;
    };
    const Quadrant quadrant = count <= quarter       ? Quadrant{u'N', count, u'E'}
                              : count <= 2 * quarter ? Quadrant{u'S', 2 * quarter - count, u'E'}
                              : count <= 3 * quarter ? Quadrant{u'S', count - 2 * quarter, u'W'}
                                                     : Quadrant{u'N', 4 * quarter - count, u'W'};
    text.append(quadrant.first);
    text.append(u' ');
    appendAngle(text, quadrant.angle);
    text.append(u' ');
    text.append(quadrant.last);
}

void UFormatBearing::appendAngle(QString &text, qint64 count) const
{
    const qint64 fractions = powerOfTen(decimals_);
    const qint64 whole = count / fractions;
    const qint64 fraction = count % fractions;
    if (unit_ == unitDms) {
        appendWhole(text, whole / 3600);
        text.append(u'°');
        appendPadded(text, whole / 60 % 60, 2);
        text.append(u'\'');
        appendPadded(text, whole % 60, 2);
        appendDecimals(text, fraction);
        text.append(u'"');
        return;
    }
    appendWhole(text, whole);
    appendDecimals(text, fraction);
    text.append(unit_ == unitGon ? u'g' : u'°');
}

void UFormatBearing::appendWhole(QString &text, qint64 whole) const
{
    const int digits = style_ == 1 && unit_ != unitGon ? 2 : 3;
    appendPadded(text, whole, padding_ != 0 ? digits : 1);
}

void UFormatBearing::appendDecimals(QString &text, qint64 fraction) const
{
    if (decimals_ > 0) {
        text.append(u'.');
        appendPadded(text, fraction, decimals_);
    }
}
