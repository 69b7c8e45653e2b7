#include "TextBuffer.h"

#include <algorithm>

namespace kareport
{

namespace
{
constexpr std::size_t firstCapacity = 512;
}

TextBuffer::TextBuffer() : data_(std::make_unique_for_overwrite<char16_t[]>(firstCapacity)), capacity_(firstCapacity) {}

TextBuffer::~TextBuffer() = default;

void TextBuffer::append(QStringView text)
{
    char16_t *end = extend(static_cast<std::size_t>(text.size()));
    std::copy_n(text.utf16(), text.size(), end);
}

void TextBuffer::appendFill(std::size_t count, char16_t character)
{
    std::fill_n(extend(count), count, character);
}

void TextBuffer::insertFill(std::size_t position, std::size_t count, char16_t character)
{
    const std::size_t oldSize = size_;
    extend(count);
    char16_t *at = data_.get() + position;
    std::copy_backward(at, data_.get() + oldSize, data_.get() + size_);
    std::fill_n(at, count, character);
}

void TextBuffer::pad(std::size_t start, int width)
{
    const auto length = static_cast<long long>(size_ - start);
    const long long wanted = width < 0 ? -static_cast<long long>(width) : width;
    if (wanted <= length) {
        return;
    }
    const auto blanks = static_cast<std::size_t>(wanted - length);
    if (width < 0) {
        appendFill(blanks, u' ');
    } else {
        insertFill(start, blanks, u' ');
    }
}

void TextBuffer::trim(std::size_t start)
{
    const QStringView text = from(start).trimmed();
    std::copy_n(text.utf16(), text.size(), data_.get() + start);
    size_ = start + static_cast<std::size_t>(text.size());
}

void TextBuffer::grow(std::size_t count)
{
    const std::size_t wanted = std::max(size_ + count, capacity_ * 2);
    auto larger = std::make_unique_for_overwrite<char16_t[]>(wanted);
    std::copy_n(data_.get(), size_, larger.get());
    data_ = std::move(larger);
    capacity_ = wanted;
}

} // namespace kareport
