#pragma once

#include <QStringView>

#include <algorithm>
#include <cstddef>
#include <memory>
#include <string_view>

namespace kareport
{

/// A growing buffer of UTF-16 characters that is reused from row to row, so that a value is formatted without an
/// allocation of its own.
///
/// All of it is in this header: a host library of its own, and the module, each have it without asking the other for it.
class TextBuffer
{
public:
    TextBuffer() : data_(std::make_unique_for_overwrite<char16_t[]>(firstCapacity)) {}
    ~TextBuffer() = default;
    TextBuffer(const TextBuffer &) = delete;
    TextBuffer &operator=(const TextBuffer &) = delete;

    /// The number of its characters.
    std::size_t size() const { return size_; }
    /// The text; valid until the next change.
    QStringView view() const { return {data_.get(), static_cast<qsizetype>(size_)}; }
    /// The text from a position (at most `size()`) to the end.
    QStringView from(std::size_t position) const { return view().sliced(static_cast<qsizetype>(position)); }

    /// Empties the text; its memory is kept for the next one.
    void clear() { size_ = 0; }
    /// Cuts the text to `size` characters, at most what it has.
    void truncate(std::size_t size) { size_ = size; }

    /// Appends a character.
    void append(char16_t character) { *extend(1) = character; }
    /// Appends a text, which must not be a piece of this one.
    void append(QStringView text)
    {
        char16_t *end = extend(static_cast<std::size_t>(text.size()));
        std::copy_n(text.utf16(), text.size(), end);
    }
    /// Appends characters of code 0 to 127.
    void appendAscii(std::string_view text)
    {
        char16_t *end = extend(text.size());
        for (const char character : text) {
            *end++ = static_cast<unsigned char>(character);
        }
    }
    /// Appends `count` times a character.
    void appendFill(std::size_t count, char16_t character) { std::fill_n(extend(count), count, character); }
    /// Inserts `count` times a character at a position (at most `size()`).
    void insertFill(std::size_t position, std::size_t count, char16_t character);
    /// Puts blanks before (`width` above 0) or after (below 0) the text from `start` on, until that part is at
    /// least |width| characters long: what C's printf does with "%*s".
    void pad(std::size_t start, int width);
    /// Takes white space off both ends of the text from `start` on.
    void trim(std::size_t start);

private:
    static constexpr std::size_t firstCapacity = 512;

    char16_t *extend(std::size_t count)
    {
        if (capacity_ - size_ < count) {
            grow(count);
        }
        char16_t *end = data_.get() + size_;
        size_ += count;
        return end;
    }
    void grow(std::size_t count);

    std::unique_ptr<char16_t[]> data_;
    std::size_t size_ = 0;
    std::size_t capacity_ = firstCapacity;
};

inline void TextBuffer::insertFill(std::size_t position, std::size_t count, char16_t character)
{
    const std::size_t oldSize = size_;
    extend(count);
    char16_t *at = data_.get() + position;
    std::copy_backward(at, data_.get() + oldSize, data_.get() + size_);
    std::fill_n(at, count, character);
}

inline void TextBuffer::pad(std::size_t start, int width)
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

inline void TextBuffer::trim(std::size_t start)
{
    const QStringView text = from(start).trimmed();
    std::copy_n(text.utf16(), text.size(), data_.get() + start);
    size_ = start + static_cast<std::size_t>(text.size());
}

inline void TextBuffer::grow(std::size_t count)
{
    const std::size_t wanted = std::max(size_ + count, capacity_ * 2);
    auto larger = std::make_unique_for_overwrite<char16_t[]>(wanted);
    std::copy_n(data_.get(), size_, larger.get());
    data_ = std::move(larger);
    capacity_ = wanted;
}

} // namespace kareport
