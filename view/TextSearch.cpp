#include "TextSearch.h"

namespace kareport
{

namespace
{

bool isWordCharacter(char32_t character)
{
    return QChar::isLetterOrNumber(character) || character == U'_';
}

char32_t characterAt(QStringView line, qsizetype at)
{
    const char16_t unit = line[at].unicode();
    if (QChar::isHighSurrogate(unit) && at + 1 < line.size() && line[at + 1].isLowSurrogate()) {
        return QChar::surrogateToUcs4(unit, line[at + 1].unicode());
    }
    return unit;
}

char32_t characterBefore(QStringView line, qsizetype at)
{
    const bool isPair = line[at - 1].isLowSurrogate() && at > 1 && line[at - 2].isHighSurrogate();
    return characterAt(line, at - (isPair ? 2 : 1));
}

} // namespace

TextSearch::TextSearch(const QString &text, bool matchCase, bool wholeWord)
    : text_(text), wholeWord_(wholeWord), matcher_(text, matchCase ? Qt::CaseSensitive : Qt::CaseInsensitive)
{}

bool TextSearch::isWord(QStringView line, qsizetype at) const
{
    const qsizetype end = at + text_.size();
    return (at == 0 || !isWordCharacter(characterBefore(line, at))) &&
           (end == line.size() || !isWordCharacter(characterAt(line, end)));
}

qsizetype TextSearch::find(QStringView line, qsizetype from) const
{
    if (text_.isEmpty()) {
        return -1;
    }
    qsizetype at = matcher_.indexIn(line, from);
    while (at >= 0 && wholeWord_ && !isWord(line, at)) {
        at = matcher_.indexIn(line, at + 1);
    }
    return at;
}

qsizetype TextSearch::findLast(QStringView line, qsizetype before) const
{
    qsizetype last = -1;
    for (qsizetype at = find(line); at >= 0 && at < before; at = find(line, at + text_.size())) {
        last = at;
    }
    return last;
}

qint64 TextSearch::count(QStringView line) const
{
    qint64 matches = 0;
    for (qsizetype at = find(line); at >= 0; at = find(line, at + text_.size())) {
        ++matches;
    }
    return matches;
}

} // namespace kareport
