#pragma once

#include <QByteArrayView>
#include <QString>
#include <QStringDecoder>

#include <array>
#include <map>
#include <memory>

namespace kareport
{

/// The bytes of fonts whose characters are signs have this code page; no real one has the number.
constexpr int symbolCodePage = 42;

/// Decodes the bytes of one code page.
class RichTextCodePage
{
public:
    /// @param number  of a code page; one that is not known here is read as 1252
    explicit RichTextCodePage(int number);

    /// Whether one byte is one character.
    bool isSingleByte() const { return singleByte_; }
    /// The character of a byte, where one byte is one character.
    char16_t character(char byte) const { return table_[static_cast<unsigned char>(byte)]; }
    /// The text of bytes that belong together, where a character may have several. What is not valid becomes U+FFFD, half
    /// a character at the end is dropped.
    QString decode(QByteArrayView bytes);

private:
    std::array<char16_t, 256> table_{};
    QStringDecoder decoder_;
    bool singleByte_ = true;
};

/// The code pages of a file, each made when it is first needed.
class RichTextCodePages
{
public:
    RichTextCodePage &page(int number);

private:
    std::map<int, std::unique_ptr<RichTextCodePage>> pages_;
};

/// The code page that a font's character set stands for; 0: that of the file.
int codePageOfCharset(int charset);

} // namespace kareport
