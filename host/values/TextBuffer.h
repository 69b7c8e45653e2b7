#pragma once

#include "KaReportExport.h"

#include <QStringView>

#include <cstddef>
#include <memory>
#include <string_view>

namespace kareport
{

/// A growing buffer of UTF-16 characters that is reused from row to row, so that a value is formatted without an
/// allocation of its own.
class KAREPORT_EXPORT TextBuffer
{
public:
    TextBuffer();
    ~TextBuffer();
    TextBuffer(const TextBuffer &) = delete;
    TextBuffer &operator=(const TextBuffer &) = delete;

    std::size_t size() const { return size_; }
    /// The text; valid until the next change.
    QStringView view() const { return {data_.get(), static_cast<qsizetype>(size_)}; }
    /// The text from a position (at most `size()`) to the end.
    QStringView from(std::size_t position) const { return view().sliced(static_cast<qsizetype>(position)); }

    void clear() { size_ = 0; }
    /// Cuts the text to `size` characters, at most what it has.
    void truncate(std::size_t size) { size_ = size; }

    void append(char16_t character) { *extend(1) = character; }
    void append(QStringView text);
    /// Appends characters of code 0 to 127.
    void appendAscii(std::string_view text)
    {
        char16_t *end = extend(text.size());
        for (const char character : text) {
            *end++ = static_cast<unsigned char>(character);
        }
    }
    void appendFill(std::size_t count, char16_t character);
    /// Inserts `count` times a character at a position (at most `size()`).
    void insertFill(std::size_t position, std::size_t count, char16_t character);
    /// Puts blanks before (`width` above 0) or behind (below 0) what stands from `start` on, until that part is at
    /// least |width| characters long: what C's printf does with "%*s".
    void pad(std::size_t start, int width);
    /// Takes white space off both ends of what stands from `start` on.
    void trim(std::size_t start);

private:
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
    std::size_t capacity_ = 0;
};

} // namespace kareport
