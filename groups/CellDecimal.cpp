#include "CellDecimal.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <string_view>

namespace kareport
{

namespace
{

constexpr std::array<double, 23> powersOfTen = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,  1e8,  1e9,  1e10, 1e11,
                                                1e12, 1e13, 1e14, 1e15, 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
constexpr int digitsOfDouble = 15; ///< a decimal of so many comes back from a double

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
    bool isBehindPoint = false;
    for (const char character : mantissa) {
        if (character == '.') {
            isBehindPoint = true;
            continue;
        }
        number.digits = number.digits * 10 + (character - '0');
        decimals += isBehindPoint ? 1 : 0;
    }
    number.exponent = exponent - decimals;
    while (number.digits != 0 && number.digits % 10 == 0) {
        number.digits /= 10;
        ++number.exponent;
    }
    number.digits = isNegative ? -number.digits : number.digits;
    return number.digits == 0 ? CellDecimal() : number;
}

/// The fewest digits that stand for a double.
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

} // namespace

double CellDecimal::toDouble() const
{
    constexpr qint64 mostExact = qint64(1) << 53;
    if (digits >= -mostExact && digits <= mostExact && exponent <= 0 &&
        static_cast<std::size_t>(-exponent) < powersOfTen.size())
    {
        return static_cast<double>(digits) / powersOfTen[static_cast<std::size_t>(-exponent)];
    }
    constexpr std::size_t mostDigits = 24;
    std::array<char, 2 * mostDigits> text;
    char *at = std::to_chars(text.data(), text.data() + mostDigits, digits).ptr;
    *at++ = 'e';
    at = std::to_chars(at, text.data() + text.size(), exponent).ptr;
    double number = 0;
    std::from_chars(text.data(), at, number);
    return number;
}

CellDecimal CellReader::readSlowly(double value)
{
    const double quotient = factor_ == 1 ? value : value / factor_;
    if (!std::isfinite(quotient))
    { // a number that was internal all along, as a computed one, may be too large for the unit
        return shortest(value);
    }
    const CellDecimal number = factor_ == 1 ? shortest(value) : safeDigits(quotient);
    if (number.toDouble() * factor_ == value) {
        const int decimals = -number.exponent;
        const bool isSafe = static_cast<double>(std::llabs(number.digits)) < mostQuick;
        if (isSafe && decimals > decimals_ && decimals <= digitsOfDouble) {
            decimals_ = decimals;
            power_ = powersOfTen[static_cast<std::size_t>(decimals)];
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
