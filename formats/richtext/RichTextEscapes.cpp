#include "RichTextTables.h"

#include <array>

namespace kareport
{

namespace
{

constexpr auto isPlain = [] {
    std::array<bool, 128> plain{};
    for (std::size_t i = 0x20; i < 0x7F; ++i) {
        plain[i] = i != '\\' && i != '{' && i != '}';
    }
    return plain;
}();

void appendEscape(QByteArray &out, char16_t character)
{
    constexpr char digits[] = "0123456789abcdef";
    switch (character) {
    case u'\0':
        // Ends a text for many readers, and shows nothing.
        return;
    case u'\t': out += "\\tab "; return;
    case u'\\':
    case u'{':
    case u'}':
        out += '\\';
        out += static_cast<char>(character);
        return;
    case QChar::LineSeparator: out += "\\line "; return;
    default: break;
    }
    if (character < 0x80 || (character >= 0xA0 && character <= 0xFF)) {
        out += "\\'";
        out += digits[character >> 4];
        out += digits[character & 15];
    } else {
        out += "\\u";
        out += QByteArray::number(static_cast<short>(character));
        out += '?';
    }
}

} // namespace

void appendRichText(QByteArray &out, QStringView text)
{
    const char16_t *at = text.utf16();
    const char16_t *const end = at + text.size();
    while (at != end) {
        const char16_t *const run = at;
        while (at != end && *at < isPlain.size() && isPlain[*at]) {
            ++at;
        }
        if (at != run) {
            const qsizetype size = out.size();
            out.resize(size + (at - run));
            char *to = out.data() + size;
            for (const char16_t *from = run; from != at; ++from) {
                *to++ = static_cast<char>(*from);
            }
        }
        if (at != end) {
            appendEscape(out, *at++);
        }
    }
}

} // namespace kareport
