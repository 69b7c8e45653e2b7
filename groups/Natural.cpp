#include "Natural.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <utility>

namespace kareport
{

namespace
{

constexpr std::array<quint32, 10> limbPowers = {1,       10,        100,        1'000,       10'000,
                                                100'000, 1'000'000, 10'000'000, 100'000'000, 1'000'000'000};

quint32 powerOfTen(int power)
{
    return limbPowers[static_cast<std::size_t>(power)];
}

} // namespace

Natural::Natural(quint64 value)
{
    for (; value != 0; value /= base) {
        limbs_.push_back(static_cast<quint32>(value % base));
    }
}

Natural::Natural(std::vector<quint32> limbs) : limbs_(std::move(limbs))
{
    trim();
}

Natural Natural::fromDigits(std::string_view digits)
{
    constexpr std::size_t atOnce = digitsOfLimb;
    std::vector<quint32> limbs;
    for (std::size_t end = digits.size(); end > 0;) {
        const std::size_t begin = end > atOnce ? end - atOnce : 0;
        quint32 limb = 0;
        std::from_chars(digits.data() + begin, digits.data() + end, limb);
        limbs.push_back(limb);
        end = begin;
    }
    return Natural(std::move(limbs));
}

void Natural::trim()
{
    while (!limbs_.empty() && limbs_.back() == 0) {
        limbs_.pop_back();
    }
}

void Natural::increment()
{
    for (quint32 &limb : limbs_) {
        if (++limb < base) {
            return;
        }
        limb = 0;
    }
    limbs_.push_back(1);
}

void Natural::multiply(quint32 factor)
{
    quint64 carry = 0;
    for (quint32 &limb : limbs_) {
        carry += quint64(limb) * factor;
        limb = static_cast<quint32>(carry % base);
        carry /= base;
    }
    for (; carry != 0; carry /= base) {
        limbs_.push_back(static_cast<quint32>(carry % base));
    }
    trim();
}

void Natural::multiply(const Natural &factor)
{
    std::vector<quint32> product(limbs_.size() + factor.limbs_.size(), 0);
    for (std::size_t i = 0; i < limbs_.size(); ++i) {
        quint64 carry = 0;
        std::size_t at = i;
        for (const quint32 limb : factor.limbs_) {
            carry += quint64(limbs_[i]) * limb + product[at];
            product[at++] = static_cast<quint32>(carry % base);
            carry /= base;
        }
        for (; carry != 0; carry /= base) {
            carry += product[at];
            product[at++] = static_cast<quint32>(carry % base);
        }
    }
    limbs_ = std::move(product);
    trim();
}

void Natural::multiplyByPowerOfTen(int power)
{
    if (isZero()) {
        return;
    }
    multiply(powerOfTen(power % digitsOfLimb));
    limbs_.insert(limbs_.begin(), static_cast<std::size_t>(power / digitsOfLimb), 0);
}

bool Natural::divide(quint64 divisor)
{
    quint64 remainder = 0;
    for (std::size_t i = limbs_.size(); i-- > 0;) {
        remainder = remainder * base + limbs_[i];
        limbs_[i] = static_cast<quint32>(remainder / divisor);
        remainder %= divisor;
    }
    trim();
    return remainder != 0;
}

bool Natural::divideByPowerOfTen(int power)
{
    const auto whole = std::min(static_cast<std::size_t>(power / digitsOfLimb), limbs_.size());
    const auto end = limbs_.begin() + static_cast<std::ptrdiff_t>(whole);
    const bool hasRest = std::any_of(limbs_.begin(), end, [](quint32 limb) { return limb != 0; });
    limbs_.erase(limbs_.begin(), end);
    return divide(powerOfTen(power % digitsOfLimb)) || hasRest;
}

std::string Natural::digits() const
{
    std::string text;
    for (std::size_t i = limbs_.size(); i-- > 0;) {
        const std::string limb = std::to_string(limbs_[i]);
        if (!text.empty()) {
            text.append(static_cast<std::size_t>(digitsOfLimb) - limb.size(), '0');
        }
        text += limb;
    }
    return text.empty() ? "0" : text;
}

} // namespace kareport
