#pragma once

#include <array>
#include <string>
#include <string_view>

namespace kareport
{

/// The fixed notation of a number, correctly rounded (halves to even on the exact binary value), as C's printf writes
/// it with "%.*f" in the "C" locale, but without its sign.
class FixedNotation
{
public:
    /// `value` must be finite; its sign is not looked at. `decimals` below 0 counts as 0.
    FixedNotation(double value, int decimals);

    /// The digits, with a point when there are decimals; valid as long as this object.
    std::string_view digits() const
    {
        return long_.empty() ? std::string_view(short_.data() + short_.size() - size_, size_) : long_;
    }
    /// Whether every digit is a 0.
    bool isZero() const { return zero_; }

private:
    bool writeByScaling(double magnitude, int decimals);
    void writeExactly(double magnitude, int decimals);

    std::array<char, 40> short_; ///< the digits are at its end
    std::size_t size_ = 0;
    std::string long_; ///< used for what does not fit into `short_`
    bool zero_ = false;
};

} // namespace kareport
