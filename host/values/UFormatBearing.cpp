#include "UFormatBearing.h"

#include "MemoryLasts.h"

#include <array>
#include <charconv>
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
    std::array<char, 24> written{};
    const auto end = std::to_chars(written.data(), written.data() + written.size(), number).ptr;
    const auto length = static_cast<int>(end - written.data());
    for (int i = length; i < digits; ++i) {
        text.append(u'0');
    }
    text.append(QLatin1StringView(written.data(), length));
}

/// Empties a text, whose memory it keeps where the text is the only one to use it.
void empty(QString &text)
{
    if (text.isDetached()) {
        text.resize(0);
    } else {
        text.clear();
    }
}

} // namespace

void UFormatBearing::ConvertToDisplayString(double value, QString &text) const
{
    empty(text);
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

    if (!kareport::doneWhileMemoryLasts([&] { appendCount(text, count, quarter); })) {
        empty(text);
    }
}

void UFormatBearing::appendCount(QString &text, qint64 count, qint64 quarter) const
{
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
