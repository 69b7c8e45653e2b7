#include "JsonText.h"

#include "DataText.h"

namespace kareport
{

void appendJsonText(std::string &out, QStringView text)
{
    constexpr char digits[] = "0123456789abcdef";
    out += '"';
    qsizetype start = 0;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t character = text[i].unicode();
        if (character >= 0x20 && character != u'"' && character != u'\\') {
            continue;
        }
        appendUtf8(out, text.sliced(start, i - start));
        start = i + 1;
        out += '\\';
        switch (character) {
        case u'"':
        case u'\\': out += static_cast<char>(character); break;
        case u'\n': out += 'n'; break;
        case u'\r': out += 'r'; break;
        case u'\t': out += 't'; break;
        default:
            out += "u00";
            out += digits[character >> 4];
            out += digits[character & 15];
        }
    }
    appendUtf8(out, text.sliced(start));
    out += '"';
}

} // namespace kareport
