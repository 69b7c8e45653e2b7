#pragma once

#include <QtGlobal>

namespace kareport
{

/// A decimal number as a cell has it: digits times a power of ten.
struct CellDecimal
{
    qint64 digits = 0;
    int exponent = 0; ///< below 0 for decimals

    /// The nearest double.
    double toDouble() const;
};

/// Says which decimal number a cell had that was read into a double and converted into an internal unit.
///
/// A number of up to 15 significant digits comes back as it was written. Of a longer one, the double that it was read into
/// counts as the shortest decimal that stands for it.
class CellReader
{
public:
    /// @param factor  what a number of the data was multiplied by to become internal
    explicit CellReader(double factor) : factor_(factor) {}
    /// Of numbers that were not converted.
    CellReader() = default;

    /// @param value  internal and finite
    CellDecimal read(double value)
    {
        const double power = power_;
        const double scaled = (factor_ == 1 ? value : value / factor_) * power;
        if (scaled > -mostQuick && scaled < mostQuick) {
            const auto digits = static_cast<qint64>(scaled < 0 ? scaled - 0.5 : scaled + 0.5);
            // Digits and power are exact in a double, so that the quotient is what reading their text gives.
            if (static_cast<double>(digits) / power * factor_ == value) {
                return {digits, -decimals_};
            }
        }
        return readSlowly(value);
    }
    /// The internal value that a number of the data has.
    double internal(const CellDecimal &number) const { return number.toDouble() * factor_; }
    double factor() const { return factor_; }

private:
    static constexpr double mostQuick = 1e15; ///< fewer digits than a double is sure to tell apart

    CellDecimal readSlowly(double value);

    double factor_ = 1;
    double power_ = 1000; ///< of ten, by the decimals that numbers had lately
    int decimals_ = 3;
};

} // namespace kareport
