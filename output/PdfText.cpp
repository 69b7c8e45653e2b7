#include "PdfText.h"

#include <QChar>

#include <array>
#include <map>

namespace kareport
{

namespace
{

constexpr qsizetype tabWidth = 8;

constexpr bool isControl(char16_t character)
{
    return character < 0x20 || (character >= 0x7F && character < 0xA0) || character == QChar::LineSeparator ||
           character == QChar::ParagraphSeparator;
}

void removeBlanksAtEnd(QString &line)
{
    qsizetype end = line.size();
    while (end > 0 && line[end - 1] == u' ') {
        --end;
    }
    line.truncate(end);
}

std::vector<CharacterCount> countsOf(const std::vector<qint64> &low, const std::map<char32_t, qint64> &high)
{
    std::vector<CharacterCount> counts;
    for (std::size_t code = 0; code < low.size(); ++code) {
        if (low[code] > 0 && !isControl(static_cast<char16_t>(code))) {
            counts.push_back({static_cast<char32_t>(code), low[code]});
        }
    }
    for (const auto &[code, count] : high) {
        counts.push_back({code, count});
    }
    return counts;
}

} // namespace

void visibleLine(QStringView line, QString &visible)
{
    visible.resize(0);
    qsizetype column = 0;
    for (qsizetype i = 0; i < line.size(); ++i) {
        const QChar character = line[i];
        if (character == u'\t') {
            const qsizetype blanks = tabWidth - column % tabWidth;
            visible.resize(visible.size() + blanks, u' ');
            column += blanks;
            continue;
        }
        if (isControl(character.unicode())) {
            continue;
        }
        if (character.isHighSurrogate() && i + 1 < line.size() && line[i + 1].isLowSurrogate()) {
            visible += character;
            visible += line[++i];
        } else {
            visible += character.isSurrogate() ? QChar(QChar::ReplacementCharacter) : character;
        }
        ++column;
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

std::vector<CharacterCount> visibleCharacters(QStringView text)
{
    std::vector<qint64> low(0x10000);
    std::map<char32_t, qint64> high;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar character = text[i];
        if (!character.isSurrogate()) {
            ++low[character.unicode()];
        } else if (character.isHighSurrogate() && i + 1 < text.size() && text[i + 1].isLowSurrogate()) {
            ++high[QChar::surrogateToUcs4(character, text[++i])];
        } else {
            ++low[QChar::ReplacementCharacter];
        }
    }
    return countsOf(low, high);
}

std::vector<CharacterCount> visibleCharacters(QLatin1StringView text)
{
    std::vector<qint64> low(0x100);
    for (const char byte : text) {
        ++low[static_cast<unsigned char>(byte)];
    }
    return countsOf(low, {});
}

} // namespace kareport
