#include "TemplateText.h"

#include <algorithm>
#include <limits>

namespace kareport
{

bool equalFolded(QStringView left, QStringView right)
{
    return left.compare(right, Qt::CaseInsensitive) == 0;
}

QString foldedKey(QStringView text)
{
    // A full folding would make two characters of one; each character is folded by itself.
    QString key;
    key.reserve(text.size());
    for (qsizetype i = 0; i < text.size(); ++i) {
        if (text[i].isHighSurrogate() && i + 1 < text.size() && text[i + 1].isLowSurrogate()) {
            const char32_t character = QChar::surrogateToUcs4(text[i], text[i + 1]);
            key.append(QStringView(QChar::fromUcs4(QChar::toCaseFolded(character))));
            ++i;
        } else {
            key.append(text[i].toCaseFolded());
        }
    }
    return key;
}

qint32 leadingInteger(QStringView text)
{
    const auto isDigit = [](QChar character) { return character >= u'0' && character <= u'9'; };
    qsizetype position = 0;
    while (position < text.size() && text[position].isSpace()) {
        ++position;
    }
    bool negative = false;
    if (position < text.size() && (text[position] == u'-' || text[position] == u'+')) {
        negative = text[position] == u'-';
        ++position;
    }
    constexpr qint64 beyond = qint64(std::numeric_limits<qint32>::max()) + 1;
    qint64 number = 0;
    for (; position < text.size() && isDigit(text[position]); ++position) {
        number = std::min(number * 10 + (text[position].unicode() - u'0'), beyond);
    }
    return static_cast<qint32>(negative ? -number : std::min(number, beyond - 1));
}

FieldMarker fieldMarker(QStringView variableName)
{
    if (equalFolded(variableName, u"FILLER")) {
        return FieldMarker::Filler;
    }
    if (equalFolded(variableName, u"SUFFIX_R")) {
        return FieldMarker::SuffixR;
    }
    if (equalFolded(variableName, u"SUFFIX_+")) {
        return FieldMarker::SuffixPlus;
    }
    return FieldMarker::None;
}

} // namespace kareport
