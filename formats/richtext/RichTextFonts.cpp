#include "RichTextFonts.h"

#include <algorithm>
#include <utility>

namespace kareport
{

int RichTextFonts::find(int number) const
{
    auto found = numbers_.find(number);
    if (found == numbers_.end()) {
        found = numbers_.find(defaultNumber_);
    }
    if (found != numbers_.end()) {
        return found->second;
    }
    const auto letters =
        std::find_if(fonts_.begin(), fonts_.end(), [](const RichTextFont &font) { return !font.hasSignBytes(); });
    return letters == fonts_.end() ? -1 : static_cast<int>(letters - fonts_.begin());
}

void RichTextFonts::begin(int number)
{
    current_ = {};
    currentNumber_ = number;
}

void RichTextFonts::commit()
{
    current_.family = std::move(current_.family).trimmed();
    if (!current_.family.isEmpty()) {
        current_.signs = signsOfFont(current_.family);
        numbers_[currentNumber_] = static_cast<int>(fonts_.size());
        fonts_.push_back(std::move(current_));
    }
    current_ = {};
}

} // namespace kareport
