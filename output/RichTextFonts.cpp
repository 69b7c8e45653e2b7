#include "RichTextFonts.h"

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
    return fonts_.empty() ? -1 : 0;
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
        numbers_[currentNumber_] = static_cast<int>(fonts_.size());
        fonts_.push_back(std::move(current_));
    }
    current_ = {};
}

} // namespace kareport
