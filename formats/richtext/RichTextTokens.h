#pragma once

#include <QByteArrayView>

#include <string_view>

namespace kareport
{

enum class RichTextTokenKind
{
    GroupStart,
    GroupEnd,
    Word,        ///< a backslash and letters, with a number or without
    Symbol,      ///< a backslash and another character; an escaped line end is '\n'
    Byte,        ///< a backslash, an apostrophe and two hexadecimal digits
    Text,        ///< bytes as they are
    MissingData, ///< binary data that would reach beyond the end
    End
};

struct RichTextToken
{
    RichTextTokenKind kind = RichTextTokenKind::End;
    std::string_view text; ///< the letters of a word, the bytes of a text
    int number = 0;        ///< of a word; numbers out of range become the last in range
    bool hasNumber = false;
    char byte = 0; ///< of a symbol or a byte
};

/// Cuts the bytes of a rich text into tokens. Line ends and zero bytes between tokens are left out, and so are binary data.
class RichTextTokens
{
public:
    explicit RichTextTokens(QByteArrayView bytes) : bytes_(bytes.data(), static_cast<std::size_t>(bytes.size())) {}

    RichTextToken next();
    /// Where the last token begins; after the end of the bytes after the last one.
    qsizetype position() const { return static_cast<qsizetype>(start_); }

private:
    RichTextToken control();
    RichTextToken word();

    std::string_view bytes_;
    std::size_t start_ = 0;
    std::size_t at_ = 0;
};

} // namespace kareport
