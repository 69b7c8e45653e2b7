#include "HtmlText.h"

#include "DataText.h"

namespace kareport
{

namespace
{

/// How a character is written in a page; null where it is written as itself.
const char *entityOf(char16_t character)
{
    switch (character) {
    case u'&': return "&amp;";
    case u'<': return "&lt;";
    case u'>': return "&gt;";
    case u'"': return "&quot;";
    case u'\'': return "&#39;";
    case u'\r': return "&#13;"; // alone it would become a line feed
    case u'\t':
    case u'\n': return nullptr;
    default: return character < 0x20 || (character >= 0x7F && character < 0xA0) ? "\xEF\xBF\xBD" : nullptr;
    }
}

} // namespace

void appendHtmlText(std::string &out, QStringView text)
{
    qsizetype start = 0;
    for (qsizetype i = 0; i < text.size(); ++i) {
        if (const char *entity = entityOf(text[i].unicode())) {
            appendUtf8(out, text.sliced(start, i - start));
            out += entity;
            start = i + 1;
        }
    }
    appendUtf8(out, text.sliced(start));
}

} // namespace kareport
