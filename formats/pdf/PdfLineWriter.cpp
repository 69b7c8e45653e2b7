#include "PdfLineWriter.h"

#include <array>
#include <charconv>
#include <cmath>

namespace kareport
{

namespace
{

constexpr int decimals = 4;
/// A glyph within this distance of its place, in thousandths of the font size, needs no move.
constexpr double nearEnough = 0.01;
/// Arrays of a PDF have 8191 entries at most.
constexpr int longestArray = 4000;
/// Strings of a PDF end before 65535 bytes; a character takes four at most.
constexpr qsizetype longestString = 16000;

/// Writes a character code of two bytes into a string.
char *writeCode(char *out, char16_t code)
{
    for (const int byte : {code >> 8, code & 0xFF}) {
        switch (byte) {
        case '(':
        case ')':
        case '\\':
            *out++ = '\\';
            *out++ = static_cast<char>(byte);
            break;
        case '\r': // a bare one would be read as LF
            *out++ = '\\';
            *out++ = 'r';
            break;
        default: *out++ = static_cast<char>(byte);
        }
    }
    return out;
}

} // namespace

void addPdfNumber(QByteArray &operators, double number)
{
    std::array<char, 64> text;
    char *end = std::to_chars(text.data(), text.data() + text.size(), number, std::chars_format::fixed, decimals).ptr;
    while (end[-1] == '0') {
        --end;
    }
    if (end[-1] == '.') {
        --end;
    }
    operators.append(text.data(), end - text.data());
}

void addPdfString(QByteArray &operators, QStringView codes)
{
    const qsizetype size = operators.size();
    operators.resize(size + 4 * codes.size() + 2);
    char *const begin = operators.data();
    char *out = begin + size;
    *out++ = '(';
    for (const QChar code : codes) {
        out = writeCode(out, code.unicode());
    }
    *out++ = ')';
    operators.truncate(out - begin);
}

PdfLineWriter::PdfLineWriter(QByteArray &operators, const std::function<const char *(std::size_t)> &fontName,
                             double fontSize)
    : operators_(operators), fontName_(fontName), fontSize_(fontSize)
{}

void PdfLineWriter::show(std::size_t font, char16_t code, double left, double rise, double stretch, double advance)
{
    if (font != font_ || rise != rise_ || stretch != stretch_) {
        setState(font, rise, stretch);
    }
    if (!isArrayOpen_) {
        operators_ += '[';
        isArrayOpen_ = true;
    }
    if (std::abs(left - pen_) > nearEnough) {
        closeString();
        addPdfNumber(operators_, (pen_ - left) / stretch_);
        ++entries_;
        pen_ = left;
    }
    string_ += QChar(code);
    pen_ += advance;
    if (string_.size() == longestString) {
        closeString();
    }
    if (entries_ >= longestArray) {
        closeArray();
    }
}

void PdfLineWriter::setState(std::size_t font, double rise, double stretch)
{
    closeArray();
    if (font != font_) {
        operators_ += QByteArray("/") + fontName_(font) + ' ';
        addPdfNumber(operators_, fontSize_);
        operators_ += " Tf\n";
        font_ = font;
    }
    if (rise != rise_) {
        addPdfNumber(operators_, rise * fontSize_ / 1000);
        operators_ += " Ts\n";
        rise_ = rise;
    }
    if (stretch != stretch_) {
        addPdfNumber(operators_, stretch * 100);
        operators_ += " Tz\n";
        stretch_ = stretch;
    }
}

void PdfLineWriter::beginText(QStringView text)
{
    closeArray();
    operators_ += "/Span <</ActualText <FEFF";
    for (const QChar character : text) {
        operators_ += QByteArray::number(uint(character.unicode()), 16).rightJustified(4, '0');
    }
    operators_ += ">>> BDC\n";
}

void PdfLineWriter::endText()
{
    closeArray();
    operators_ += "EMC\n";
}

void PdfLineWriter::end()
{
    setState(0, 0, 1);
}

void PdfLineWriter::closeString()
{
    if (!string_.isEmpty()) {
        addPdfString(operators_, string_);
        string_.resize(0);
        ++entries_;
    }
}

void PdfLineWriter::closeArray()
{
    if (isArrayOpen_) {
        closeString();
        operators_ += "]TJ\n";
        isArrayOpen_ = false;
        entries_ = 0;
    }
}

} // namespace kareport
