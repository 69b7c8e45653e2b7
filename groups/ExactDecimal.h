#pragma once

#include "Natural.h"

#include <string>
#include <vector>

namespace kareport
{

/// What a number of one unit is multiplied by to be in another one: exactly, but for a factor of pi, which has 60 digits.
struct UnitRatio
{
    std::vector<quint32> factors;  ///< multiplied with each other
    std::vector<quint32> divisors; ///< from 1
    int pi = 0;                    ///< 1 multiplies by pi as well, -1 divides by it
};

/// A number that was rounded to some decimals.
struct RoundedDecimal
{
    bool isNegative = false; ///< the number was below 0, also where its digits are all 0
    bool isZero = true;      ///< the number was exactly 0
    std::string digits;      ///< in fixed notation, without a sign

    /// Whether a double holds every number of so many digits exactly enough to print it.
    bool fitsDouble() const;
};

/// A decimal number that no rounding has touched.
class ExactDecimal
{
public:
    ExactDecimal() = default;
    /// @param digits    the number without its decimal point
    /// @param decimals  how many of the digits are after the point, from 0
    ExactDecimal(bool isNegative, Natural digits, int decimals)
        : isNegative_(isNegative), digits_(std::move(digits)), decimals_(decimals)
    {}

    bool isZero() const { return digits_.isZero(); }
    /// The number times a ratio, divided by a divisor (from 1 to `Natural::mostDivisor`), rounded once; halves to even.
    RoundedDecimal rounded(const UnitRatio &ratio, quint64 divisor, int decimals) const;
    /// The nearest double; infinite for a number beyond all of them.
    double toDouble() const;

private:
    bool isNegative_ = false;
    Natural digits_;
    int decimals_ = 0;
};

} // namespace kareport
