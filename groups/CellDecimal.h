#pragma once

#include <QtGlobal>

namespace kareport
{

/// A decimal number as a cell has it: digits times a power of ten.
struct CellDecimal
{
    qint64 digits = 0;
    int exponent = 0; ///< below 0 for decimals

    /// The nearest double; infinite for a number beyond all of them.
    double toDouble() const;
};

/// Says which decimal number a cell had that was read into a double and converted into an internal unit.
///
/// A number of up to 15 significant digits comes back as it was written. Of a longer one, the double that it was read into
/// counts as the shortest decimal that reads as it. Degrees are counted in seconds: a third of a degree is not a
/// decimal number, but 1200 seconds are.
class CellReader
{
public:
    static constexpr int secondsOfDegree = 3600;

    /// @param factor   what a number of the data was multiplied by to become internal
    /// @param perUnit  what a unit of the data is counted as: 1, or `secondsOfDegree` for degrees
    explicit CellReader(double factor, int perUnit = 1) : factor_(factor), perUnit_(perUnit) {}
    /// Of numbers that were not converted.
    CellReader() = default;

    /// @param value  internal and finite @return what it is counted as
    CellDecimal read(double value)
    {
        CellDecimal number;
        return readQuickly(value, number) ? number : readSlowly(value);
    }
    /// Reads a value that has no more decimals than values had lately, and not too many digits with so many.
    /// @return whether it is one
    bool readQuickly(double value, CellDecimal &number) const
    {
        const double power = power_;
        const double scaled = (factor_ == 1 ? value : value / factor_) * power;
        if (!(scaled > -mostQuick && scaled < mostQuick)) {
            return false;
        }
        const auto digits = static_cast<qint64>(scaled < 0 ? scaled - 0.5 : scaled + 0.5);
        // Digits and power are exact in a double, so that the quotient is what reading their text gives.
        if (static_cast<double>(digits) / power * factor_ != value) {
            return false;
        }
        number = counted({digits, -decimals_});
        return true;
    }
    /// The internal value of a number as it is counted.
    double internal(double number) const { return number / perUnit_ * factor_; }
    double factor() const { return factor_; }
    int perUnit() const { return perUnit_; }

private:
    static constexpr double mostQuick = 1e15; ///< fewer digits than a double is sure to tell apart

    /// A number of the data as it is counted. @param number  of up to 17 digits
    CellDecimal counted(const CellDecimal &number) const
    {
        return perUnit_ == 1 ? number : CellDecimal{number.digits * (secondsOfDegree / 100), number.exponent + 2};
    }
    CellDecimal readSlowly(double value);
    CellDecimal readNumber(double value, double quotient);
    bool readSeconds(double value, CellDecimal &seconds) const;
    int mostDecimals() const;

    double factor_ = 1;
    int perUnit_ = 1;
    double power_ = 1000; ///< of ten, by the decimals that numbers had lately
    int decimals_ = 3;
};

} // namespace kareport
