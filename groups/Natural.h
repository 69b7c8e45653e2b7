#pragma once

#include <QtGlobal>

#include <string>
#include <string_view>
#include <vector>

namespace kareport
{

/// A whole number from 0 on, of any size, in decimal digits.
class Natural
{
public:
    /// The largest divisor of `divide`.
    static constexpr quint64 mostDivisor = quint64(1) << 34;
    static constexpr quint32 base = 1'000'000'000; ///< of its limbs
    static constexpr int digitsOfLimb = 9;

    Natural() = default;
    explicit Natural(quint64 value);
    /// @param limbs  below `base` each, the lowest first
    explicit Natural(std::vector<quint32> limbs);
    /// @param digits  ASCII digits alone
    static Natural fromDigits(std::string_view digits);

    bool isZero() const { return limbs_.empty(); }
    bool isOdd() const { return !limbs_.empty() && limbs_.front() % 2 != 0; }

    void increment();
    void multiply(quint32 factor);
    void multiply(const Natural &factor);
    void multiplyByPowerOfTen(int power);
    /// Divides, rounding down. @param divisor  from 1 to `mostDivisor` @return whether there is a remainder
    bool divide(quint64 divisor);
    bool divideByPowerOfTen(int power);

    /// Its digits without zeros in front; "0" for 0.
    std::string digits() const;

private:
    void trim();

    std::vector<quint32> limbs_; ///< the lowest first; the highest is not 0
};

} // namespace kareport
