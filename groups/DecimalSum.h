#pragma once

#include "CellDecimal.h"
#include "ExactDecimal.h"

#include <array>
#include <memory>
#include <string_view>

namespace kareport
{

/// The exact sum of decimal numbers, of any size that doubles have.
class DecimalSum
{
public:
    DecimalSum() = default;
    ~DecimalSum() = default;
    DecimalSum(const DecimalSum &) = delete;
    DecimalSum &operator=(const DecimalSum &) = delete;
    DecimalSum(DecimalSum &&) = default;
    DecimalSum &operator=(DecimalSum &&) = default;

    void add(const CellDecimal &number)
    {
        const int decimals = -number.exponent;
        if (decimals < 0 || decimals > mostDecimals) {
            addLimbs(number);
            return;
        }
        if (decimals > decimals_) {
            flush();
            decimals_ = decimals;
        }
        const auto missing = static_cast<std::size_t>(decimals_ - decimals);
        const qint64 most = mostQuick / powersOfTen[missing];
        if (number.digits > most || number.digits < -most) {
            addLimbs(number);
            return;
        }
        quick_ += number.digits * powersOfTen[missing];
        if (quick_ > mostQuick || quick_ < -mostQuick) {
            flush();
        }
    }
    /// Adds a number in fixed notation, without a sign.
    void add(bool isNegative, std::string_view digits);
    /// Adds another sum.
    void add(const DecimalSum &other);
    /// Goes back to 0.
    void clear();

    ExactDecimal exact() const;
    /// The nearest double; infinite for a sum beyond all of them.
    double toDouble() const;

private:
    static constexpr int mostDecimals = 18;
    static constexpr qint64 mostQuick = 4'000'000'000'000'000'000; ///< two of them fit into 64 bits
    static constexpr std::array<qint64, mostDecimals + 1> powersOfTen = {1,
                                                                         10,
                                                                         100,
                                                                         1'000,
                                                                         10'000,
                                                                         100'000,
                                                                         1'000'000,
                                                                         10'000'000,
                                                                         100'000'000,
                                                                         1'000'000'000,
                                                                         10'000'000'000,
                                                                         100'000'000'000,
                                                                         1'000'000'000'000,
                                                                         10'000'000'000'000,
                                                                         100'000'000'000'000,
                                                                         1'000'000'000'000'000,
                                                                         10'000'000'000'000'000,
                                                                         100'000'000'000'000'000,
                                                                         1'000'000'000'000'000'000};

    // From 10^-360 on, below the last digit of the least double, to beyond sums of the largest one.
    static constexpr int lowestExponent = -360;
    static constexpr std::size_t limbCount = 80;
    struct Limbs
    {
        std::array<qint64, limbCount> values{}; ///< of any sign, the lowest first, each nine digits further on
        quint64 additions = 0;                  ///< since the values were below 10^9
    };

    Limbs &limbs();
    void addLimbs(const CellDecimal &number);
    void flush();
    static void carry(Limbs &limbs);

    qint64 quick_ = 0;             ///< a part of the sum, without its decimal point
    int decimals_ = 0;             ///< of `quick_`
    std::unique_ptr<Limbs> limbs_; ///< the rest of the sum; null for none
};

} // namespace kareport
