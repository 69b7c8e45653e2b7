#include "DecimalSum.h"

#include <algorithm>
#include <charconv>
#include <iterator>
#include <vector>

namespace kareport
{

void DecimalSum::add(bool isNegative, std::string_view digits)
{
    constexpr std::size_t atOnce = Natural::digitsOfLimb;
    const std::size_t point = std::min(digits.find('.'), digits.size());
    const auto addRun = [&](std::string_view run, int exponentOfFirst) {
        for (std::size_t at = 0; at < run.size(); at += atOnce) {
            const std::string_view piece = run.substr(at, atOnce);
            qint64 number = 0;
            std::from_chars(piece.data(), piece.data() + piece.size(), number);
            add({isNegative ? -number : number, exponentOfFirst - static_cast<int>(at + piece.size()) + 1});
        }
    };
    addRun(digits.substr(0, point), static_cast<int>(point) - 1);
    addRun(digits.substr(std::min(point + 1, digits.size())), -1);
}

void DecimalSum::add(const DecimalSum &other)
{
    add(CellDecimal{other.quick_, -other.decimals_});
    if (!other.limbs_) {
        return;
    }
    Limbs &sum = limbs();
    for (std::size_t i = 0; i < limbCount; ++i) {
        sum.values[i] += other.limbs_->values[i];
    }
    sum.additions += other.limbs_->additions + 1;
    carry(sum);
}

void DecimalSum::clear()
{
    quick_ = 0;
    if (limbs_) {
        *limbs_ = Limbs();
    }
}

DecimalSum::Limbs &DecimalSum::limbs()
{
    if (!limbs_) {
        limbs_ = std::make_unique<Limbs>();
    }
    return *limbs_;
}

void DecimalSum::flush()
{
    if (quick_ != 0) {
        const CellDecimal number{quick_, -decimals_};
        quick_ = 0;
        addLimbs(number);
    }
}

void DecimalSum::addLimbs(const CellDecimal &number)
{
    constexpr qint64 base = Natural::base;
    Limbs &sum = limbs();
    const int place = number.exponent - lowestExponent;
    auto at = static_cast<std::size_t>(place / Natural::digitsOfLimb);
    const qint64 shift = powersOfTen[static_cast<std::size_t>(place % Natural::digitsOfLimb)];
    for (qint64 rest = number.digits; rest != 0; rest /= base) {
        const qint64 piece = rest % base * shift;
        sum.values[at] += piece % base;
        sum.values[++at] += piece / base;
    }
    constexpr quint64 mostAdditions = quint64(1) << 31;
    if (++sum.additions > mostAdditions) {
        carry(sum);
    }
}

/// Brings all values but the highest into 0 to 10^9; that then has the sign of the sum.
void DecimalSum::carry(Limbs &limbs)
{
    constexpr qint64 base = Natural::base;
    qint64 over = 0;
    for (std::size_t i = 0; i + 1 < limbCount; ++i) {
        const qint64 value = limbs.values[i] + over;
        qint64 rest = value % base;
        over = value / base;
        if (rest < 0) {
            rest += base;
            --over;
        }
        limbs.values[i] = rest;
    }
    limbs.values[limbCount - 1] += over;
    limbs.additions = 0;
}

ExactDecimal DecimalSum::exact() const
{
    if (!limbs_) {
        const auto magnitude = static_cast<quint64>(quick_ < 0 ? -quick_ : quick_);
        return {quick_ < 0, Natural(magnitude), decimals_};
    }
    DecimalSum sum;
    sum.limbs() = *limbs_;
    sum.addLimbs({quick_, -decimals_});
    Limbs &all = *sum.limbs_;
    carry(all);
    const bool isNegative = all.values.back() < 0;
    if (isNegative) {
        std::transform(all.values.begin(), all.values.end(), all.values.begin(), [](qint64 value) { return -value; });
        carry(all);
    }
    const auto first = std::find_if(all.values.begin(), all.values.end(), [](qint64 value) { return value != 0; });
    constexpr auto wholeLimbs = static_cast<std::ptrdiff_t>(-lowestExponent / Natural::digitsOfLimb);
    const std::ptrdiff_t skipped = std::min(first - all.values.begin(), wholeLimbs);
    std::vector<quint32> limbs;
    std::transform(all.values.begin() + skipped, all.values.end(), std::back_inserter(limbs),
                   [](qint64 value) { return static_cast<quint32>(value); });
    return {isNegative, Natural(std::move(limbs)), -lowestExponent - static_cast<int>(skipped) * Natural::digitsOfLimb};
}

double DecimalSum::toDouble() const
{
    return limbs_ ? exact().toDouble() : CellDecimal{quick_, -decimals_}.toDouble();
}

} // namespace kareport
