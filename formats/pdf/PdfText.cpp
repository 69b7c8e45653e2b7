#include "PdfText.h"

#include "CharacterCells.h"
#include "Characters.h"

#include <QChar>

#include <algorithm>
#include <set>
#include <vector>

namespace kareport
{

namespace
{

void removeBlanksAtEnd(QString &line)
{
    qsizetype end = line.size();
    while (end > 0 && line[end - 1] == u' ') {
        --end;
    }
    line.truncate(end);
}

/// Which characters of the basic plane occur, and the others.
struct Seen
{
    std::vector<char> low;
    std::set<char32_t> high;

    std::u32string visible() const
    {
        std::u32string characters;
        for (std::size_t code = 0; code < low.size(); ++code) {
            if (low[code] != 0 && !isControl(static_cast<char16_t>(code))) {
                characters += static_cast<char32_t>(code);
            }
        }
        characters.append(high.begin(), high.end());
        return characters;
    }
};

template <typename Text>
WideLines findWideLines(const Text &text, const std::u32string &characters, qint64 room)
{
    // A line has as many cells as characters at most where no character takes more than one.
    const bool mayBeWider = text.contains(u'\t') || std::any_of(characters.begin(), characters.end(),
                                                                [](char32_t c) { return cellsOf(c) > 1; });
    WideLines found;
    QString visible;
    qint64 line = 0;
    for (qsizetype at = 0; at < text.size();) {
        const qsizetype feed = text.indexOf(u'\n', at);
        const qsizetype end = feed < 0 ? text.size() : feed;
        ++line;
        if (mayBeWider || end - at > room) {
            visibleLine(text.sliced(at, end - at), visible);
            const qint64 cells = cellsOf(visible);
            if (cells > room) {
                found.first = found.count == 0 ? line : found.first;
                found.widest = std::max(found.widest, cells);
                ++found.count;
            }
        }
        at = end + 1;
    }
    return found;
}

} // namespace

void visibleLine(QStringView line, QString &visible)
{
    visible.resize(0);
    qsizetype column = 0;
    for (qsizetype i = 0; i < line.size(); ++i) {
        const QChar character = line[i];
        if (character == u'\t') {
            const qsizetype blanks = tabColumns - column % tabColumns;
            visible.resize(visible.size() + blanks, u' ');
            column += blanks;
            continue;
        }
        if (isControl(character.unicode())) {
            continue;
        }
        if (character.isHighSurrogate() && i + 1 < line.size() && line[i + 1].isLowSurrogate()) {
            column += cellsOf(QChar::surrogateToUcs4(character, line[i + 1]));
            visible += character;
            visible += line[++i];
        } else {
            visible += character.isSurrogate() ? QChar(QChar::ReplacementCharacter) : character;
            column += cellsOf(static_cast<char32_t>(visible.back().unicode()));
        }
    }
    removeBlanksAtEnd(visible);
}

void visibleLine(QLatin1StringView line, QString &visible)
{
    visible.resize(line.size());
    QChar *out = visible.data();
    bool hasControls = false;
    for (const char byte : line) {
        const char16_t character = static_cast<unsigned char>(byte);
        hasControls = hasControls || isControl(character);
        *out++ = character;
    }
    if (hasControls) {
        const QString copy = visible;
        visibleLine(QStringView(copy), visible);
        return;
    }
    removeBlanksAtEnd(visible);
}

std::u32string visibleCharacters(QStringView text)
{
    Seen seen{std::vector<char>(planeSize), {}};
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar character = text[i];
        if (!character.isSurrogate()) {
            seen.low[character.unicode()] = 1;
        } else if (character.isHighSurrogate() && i + 1 < text.size() && text[i + 1].isLowSurrogate()) {
            seen.high.insert(QChar::surrogateToUcs4(character, text[++i]));
        } else {
            seen.low[QChar::ReplacementCharacter] = 1;
        }
    }
    return seen.visible();
}

std::u32string visibleCharacters(QLatin1StringView text)
{
    Seen seen{std::vector<char>(0x100), {}};
    for (const char byte : text) {
        seen.low[static_cast<unsigned char>(byte)] = 1;
    }
    return seen.visible();
}

WideLines wideLines(QStringView text, const std::u32string &characters, qint64 room)
{
    return findWideLines(text, characters, room);
}

WideLines wideLines(QLatin1StringView text, const std::u32string &characters, qint64 room)
{
    return findWideLines(text, characters, room);
}

} // namespace kareport
