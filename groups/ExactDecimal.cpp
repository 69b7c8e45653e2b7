#include "ExactDecimal.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <string_view>
#include <system_error>

namespace kareport
{

namespace
{

constexpr std::string_view pi = "3141592653589793238462643383279502884197169399375105820974944";
constexpr int piDecimals = 60;
constexpr std::string_view reciprocalOfPi = "318309886183790671537767526745028724068919291480912897495334";
constexpr int reciprocalDecimals = 60;

/// Digits with a point before the last `decimals` of them.
std::string withPoint(std::string digits, int decimals)
{
    if (decimals <= 0) {
        return digits;
    }
    const auto fraction = static_cast<std::size_t>(decimals);
    if (digits.size() <= fraction) {
        digits.insert(0, fraction + 1 - digits.size(), '0');
    }
    return digits.insert(digits.size() - fraction, 1, '.');
}

} // namespace

bool RoundedDecimal::fitsDouble() const
{
    constexpr std::size_t digitsOfDouble = 15;
    const std::size_t first = digits.find_first_of("123456789");
    if (first == std::string::npos) {
        return true;
    }
    const auto count = std::count_if(digits.begin() + static_cast<std::ptrdiff_t>(first), digits.end(),
                                     [](char character) { return character != '.'; });
    return static_cast<std::size_t>(count) <= digitsOfDouble;
}

RoundedDecimal ExactDecimal::rounded(const UnitRatio &ratio, quint64 divisor, int decimals) const
{
    decimals = std::max(decimals, 0);
    Natural number = digits_;
    number.multiply(2); // what is left of one half decides
    for (const quint32 factor : ratio.factors) {
        number.multiply(factor);
    }
    int power = decimals - decimals_;
    if (ratio.pi != 0) {
        number.multiply(Natural::fromDigits(ratio.pi > 0 ? pi : reciprocalOfPi));
        power -= ratio.pi > 0 ? piDecimals : reciprocalDecimals;
    }
    if (power > 0) {
        number.multiplyByPowerOfTen(power);
    }
    bool hasRest = power < 0 && number.divideByPowerOfTen(-power);
    for (const quint32 by : ratio.divisors) {
        hasRest = number.divide(by) || hasRest;
    }
    hasRest = number.divide(divisor) || hasRest;
    const bool isHalf = number.isOdd();
    number.divide(2);
    if (isHalf && (hasRest || number.isOdd())) {
        number.increment();
    }
    return {isNegative_ && !isZero(), isZero(), withPoint(number.digits(), decimals)};
}

double ExactDecimal::toDouble() const
{
    const std::string text = withPoint(digits_.digits(), decimals_);
    double number = 0;
    const auto end = text.data() + text.size();
    if (std::from_chars(text.data(), end, number).ec == std::errc::result_out_of_range) {
        const bool isLarge = text.find_first_of("123456789") < text.find('.');
        number = isLarge ? std::numeric_limits<double>::infinity() : 0;
    }
    return isNegative_ ? -number : number;
}

} // namespace kareport
