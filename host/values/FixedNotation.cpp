#include "FixedNotation.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdint>

namespace kareport
{

namespace
{

/// Powers of ten that a double holds exactly and whose product with a value can stay below 2^50.
constexpr std::array<double, 16> powersOfTen = {1e0, 1e1, 1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                                1e8, 1e9, 1e10, 1e11, 1e12, 1e13, 1e14, 1e15};
constexpr double scalingLimit = 1125899906842624.0; // 2^50: below it a half is held exactly beside the product

/// A double has no more decimals than this; what follows are zeros.
constexpr int mostExactDecimals = 1074;

constexpr auto digitPairs = [] {
    std::array<char, 200> pairs{};
    for (std::size_t i = 0; i < 100; ++i) {
        pairs[2 * i] = static_cast<char>('0' + i / 10);
        pairs[2 * i + 1] = static_cast<char>('0' + i % 10);
    }
    return pairs;
}();

/// Takes two digits off the end of a number and writes them before `end`.
char *takePair(char *end, std::uint64_t &number)
{
    const auto pair = static_cast<std::size_t>(number % 100) * 2;
    number /= 100;
    *--end = digitPairs[pair + 1];
    *--end = digitPairs[pair];
    return end;
}

char *takeDigit(char *end, std::uint64_t &number)
{
    *--end = static_cast<char>('0' + number % 10);
    number /= 10;
    return end;
}

/// What rounding takes from a product: a * b is the sum of `product` and this, exactly. Both factors are within reach of
/// the splitting below, far from the limits of a double.
double roundingError(double a, double b, double product)
{
#ifdef FP_FAST_FMA
    return std::fma(a, b, -product);
#else
    // Without the instruction, the library's function for it is called through two jumps, and on some processors
    // costs ten times the rest of a number. Halves of 26 bits multiply exactly.
    constexpr double splitter = 134217729.0; // 2^27 + 1
    const auto highHalf = [](double value) {
        const double scaled = splitter * value;
        return scaled - (scaled - value);
    };
    const double aHigh = highHalf(a);
    const double bHigh = highHalf(b);
    const double aLow = a - aHigh;
    const double bLow = b - bHigh;
    return ((aHigh * bHigh - product) + aHigh * bLow + aLow * bHigh) + aLow * bLow;
#endif
}

} // namespace

FixedNotation::FixedNotation(double value, int decimals)
{
    const double magnitude = std::fabs(value);
    decimals = std::max(decimals, 0);
    if (!writeByScaling(magnitude, decimals)) {
        writeExactly(magnitude, decimals);
    }
}

// The value times a power of ten is the sum of the rounded product and its exact error. Only a product that ends in one
// half needs the error: its sign says on which side of the half the exact product is, or that it is a tie.
bool FixedNotation::writeByScaling(double magnitude, int decimals)
{
    if (decimals >= static_cast<int>(powersOfTen.size())) {
        return false;
    }
    const double power = powersOfTen[static_cast<std::size_t>(decimals)];
    const double product = magnitude * power;
    if (!(product < scalingLimit)) {
        return false;
    }
    auto count = static_cast<std::uint64_t>(product);
    const double aboveHalf = (product - static_cast<double>(count)) - 0.5;
    if (aboveHalf == 0.0) {
        const double error = roundingError(magnitude, power, product);
        count += error > 0.0 || (error == 0.0 && count % 2 != 0) ? 1U : 0U;
    } else {
        count += aboveHalf > 0.0 ? 1U : 0U;
    }
    zero_ = count == 0;

    char *const end = short_.data() + short_.size();
    char *begin = end;
    if (decimals > 0) {
        for (int left = decimals; left > 1; left -= 2) {
            begin = takePair(begin, count);
        }
        if (decimals % 2 != 0) {
            begin = takeDigit(begin, count);
        }
        *--begin = '.';
    }
    while (count >= 10) {
        begin = takePair(begin, count);
    }
    if (count > 0 || begin == end || *begin == '.') {
        begin = takeDigit(begin, count);
    }
    size_ = static_cast<std::size_t>(end - begin);
    return true;
}

void FixedNotation::writeExactly(double magnitude, int decimals)
{
    const int exact = std::min(decimals, mostExactDecimals);
    // The largest double has 309 digits before its point.
    const int longest = 310 + 1 + exact;
    long_.resize(static_cast<std::size_t>(longest));
    const auto result =
        std::to_chars(long_.data(), long_.data() + long_.size(), magnitude, std::chars_format::fixed, exact);
    long_.resize(static_cast<std::size_t>(result.ptr - long_.data()));
    long_.append(static_cast<std::size_t>(decimals - exact), '0');
    zero_ = long_.find_first_not_of("0.") == std::string::npos;
}

} // namespace kareport
