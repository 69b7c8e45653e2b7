#include "CellDecimal.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <string_view>
#include <system_error>

namespace kareport
{

namespace
{

constexpr std::array<double, 23> exactPowers = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,  1e8,  1e9,  1e10, 1e11,
                                                1e12, 1e13, 1e14, 1e15, 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
constexpr int digitsOfDouble = 15;                ///< a decimal of so many comes back from a double
constexpr qint64 digitsOfParts = 100'000'000'000; ///< degrees of fewer digits were written as such

/// The number of a text in scientific notation, without zeros at the end of its digits.
CellDecimal parse(std::string_view text)
{
    CellDecimal number;
    const bool isNegative = text.front() == '-';
    const std::size_t mark = text.find('e');
    std::string_view mantissa = text.substr(isNegative ? 1 : 0, mark - (isNegative ? 1 : 0));
    int exponent = 0;
    const std::size_t sign = text[mark + 1] == '+' ? 2 : 1; // a plus is not read
    std::from_chars(text.data() + mark + sign, text.data() + text.size(), exponent);
    int decimals = 0;
    bool isAfterPoint = false;
    for (const char character : mantissa) {
        if (character == '.') {
            isAfterPoint = true;
            continue;
        }
        number.digits = number.digits * 10 + (character - '0');
        decimals += isAfterPoint ? 1 : 0;
    }
    number.exponent = exponent - decimals;
    while (number.digits != 0 && number.digits % 10 == 0) {
        number.digits /= 10;
        ++number.exponent;
    }
    number.digits = isNegative ? -number.digits : number.digits;
    return number.digits == 0 ? CellDecimal() : number;
}

/// The fewest digits that read as a double.
CellDecimal shortest(double value)
{
    std::array<char, 40> text;
    const auto end = std::to_chars(text.data(), text.data() + text.size(), value, std::chars_format::scientific).ptr;
    return parse({text.data(), static_cast<std::size_t>(end - text.data())});
}

/// A double rounded to the digits that are sure to come back.
CellDecimal safeDigits(double value)
{
    std::array<char, 40> text;
    const auto end =
        std::to_chars(text.data(), text.data() + text.size(), value, std::chars_format::scientific, digitsOfDouble - 1)
            .ptr;
    return parse({text.data(), static_cast<std::size_t>(end - text.data())});
}

/// What reading degrees, minutes and seconds gives. @param count  of seconds, in parts of which a second has `power`
double degreesOf(qint64 count, qint64 power)
{
    const qint64 minutes = count / (60 * power);
    const double seconds = static_cast<double>(count % (60 * power)) / static_cast<double>(power);
    return static_cast<double>(minutes / 60) + static_cast<double>(minutes % 60) / 60 +
           seconds / CellReader::secondsOfDegree;
}

/// The same of degrees, and minutes with decimals.
double degreesInMinutes(qint64 count, qint64 power)
{
    const qint64 degree = CellReader::secondsOfDegree * power;
    return static_cast<double>(count / degree) +
           static_cast<double>(count % degree) / static_cast<double>(60 * power) / 60;
}

} // namespace

double CellDecimal::toDouble() const
{
    constexpr qint64 mostExact = qint64(1) << 53;
    if (digits >= -mostExact && digits <= mostExact && exponent <= 0 &&
        static_cast<std::size_t>(-exponent) < exactPowers.size())
    {
        return static_cast<double>(digits) / exactPowers[static_cast<std::size_t>(-exponent)];
    }
    constexpr std::size_t mostDigits = 24;
    std::array<char, 2 * mostDigits> text;
    char *at = std::to_chars(text.data(), text.data() + mostDigits, digits).ptr;
    *at++ = 'e';
    at = std::to_chars(at, text.data() + text.size(), exponent).ptr;
    double number = 0;
    const bool isOutOfRange = std::from_chars(text.data(), at, number).ec == std::errc::result_out_of_range;
    if (isOutOfRange && exponent > 0) {
        return digits < 0 ? -std::numeric_limits<double>::infinity() : std::numeric_limits<double>::infinity();
    }
    return isOutOfRange ? 0 : number;
}

/// How many decimals are tried before all else: so few that degrees with them are none of minutes and seconds.
int CellReader::mostDecimals() const
{
    constexpr int decimalsOfDegrees = 9;
    return perUnit_ == 1 ? digitsOfDouble : decimalsOfDegrees;
}

CellDecimal CellReader::readSlowly(double value)
{
    const double quotient = factor_ == 1 ? value : value / factor_;
    if (!std::isfinite(quotient))
    { // a number that was internal all along, as a computed one, may be too large for the unit
        return counted(shortest(value));
    }
    const CellDecimal number = readNumber(value, quotient);
    if (CellDecimal seconds; perUnit_ != 1 && std::llabs(number.digits) >= digitsOfParts && readSeconds(value, seconds))
    {
        return seconds;
    }
    return counted(number);
}

/// Finds the degrees, minutes and seconds that a value was read from, as their parts are added when they are read.
/// @return whether there are such, with up to four decimals of the seconds
bool CellReader::readSeconds(double value, CellDecimal &seconds) const
{
    constexpr double mostSeconds = 1e12;
    constexpr int mostDecimalsOfSeconds = 4;
    const double degrees = std::fabs(value) / factor_;
    qint64 power = 1; // of ten
    for (int decimals = 0; decimals <= mostDecimalsOfSeconds; ++decimals, power *= 10) {
        const double scaled = degrees * secondsOfDegree * static_cast<double>(power);
        if (!(scaled < mostSeconds)) {
            return false;
        }
        const qint64 count = std::llround(scaled);
        const qint64 half = 180 * secondsOfDegree * power;
        const auto is = [&](double read) { return read * factor_ == std::fabs(value); };
        // As an angle, or as a bearing of a quadrant.
        if (is(degreesOf(count, power)) || is(degreesInMinutes(count, power)) ||
            is(180 + degreesOf(count - half, power)) || is(180 - degreesOf(half - count, power)) ||
            is(360 - degreesOf(2 * half - count, power)))
        {
            seconds = {value < 0 ? -count : count, -decimals};
            return true;
        }
    }
    return false;
}

/// The number of the data, in its own unit.
CellDecimal CellReader::readNumber(double value, double quotient)
{
    const CellDecimal number = factor_ == 1 ? shortest(value) : safeDigits(quotient);
    if (number.toDouble() * factor_ == value) {
        // A number that has fewer decimals is here because it has too many digits with those of the ones before.
        const int decimals = std::max(-number.exponent, 0);
        if (decimals != decimals_ && decimals <= mostDecimals()) {
            const double power = exactPowers[static_cast<std::size_t>(decimals)];
            const bool isSafe = std::fabs(quotient) * power < mostQuick;
            decimals_ = isSafe ? decimals : decimals_;
            power_ = isSafe ? power : power_;
        }
        return number;
    }
    // The number itself is near the quotient; of those that would have become the value, one of few digits was written.
    CellDecimal best = shortest(quotient);
    bool isFound = best.toDouble() * factor_ == value;
    for (const double towards : {-std::numeric_limits<double>::infinity(), std::numeric_limits<double>::infinity()}) {
        double near = quotient;
        for (int i = 0; i < 2; ++i) {
            near = std::nextafter(near, towards);
            const CellDecimal other = shortest(near);
            if (near * factor_ == value && (!isFound || std::llabs(other.digits) < std::llabs(best.digits))) {
                best = other;
                isFound = true;
            }
        }
    }
    return best;
}

} // namespace kareport
