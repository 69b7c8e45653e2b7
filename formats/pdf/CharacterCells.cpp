#include "CharacterCells.h"

#include <QChar>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

struct Range
{
    char32_t first;
    char32_t last;
};

/// Unicode's East_Asian_Width W and F, in order; ranges that only unassigned characters part are joined.
constexpr Range wideRanges[] = {
    {0x1100, 0x115F},   {0x231A, 0x231B},   {0x2329, 0x232A},   {0x23E9, 0x23EC},   {0x23F0, 0x23F0},
    {0x23F3, 0x23F3},   {0x25FD, 0x25FE},   {0x2614, 0x2615},   {0x2648, 0x2653},   {0x267F, 0x267F},
    {0x2693, 0x2693},   {0x26A1, 0x26A1},   {0x26AA, 0x26AB},   {0x26BD, 0x26BE},   {0x26C4, 0x26C5},
    {0x26CE, 0x26CE},   {0x26D4, 0x26D4},   {0x26EA, 0x26EA},   {0x26F2, 0x26F3},   {0x26F5, 0x26F5},
    {0x26FA, 0x26FA},   {0x26FD, 0x26FD},   {0x2705, 0x2705},   {0x270A, 0x270B},   {0x2728, 0x2728},
    {0x274C, 0x274C},   {0x274E, 0x274E},   {0x2753, 0x2755},   {0x2757, 0x2757},   {0x2795, 0x2797},
    {0x27B0, 0x27B0},   {0x27BF, 0x27BF},   {0x2B1B, 0x2B1C},   {0x2B50, 0x2B50},   {0x2B55, 0x2B55},
    {0x2E80, 0x303E},   {0x3041, 0x3247},   {0x3250, 0x4DBF},   {0x4E00, 0xA4C6},   {0xA960, 0xA97C},
    {0xAC00, 0xD7A3},   {0xF900, 0xFAD9},   {0xFE10, 0xFE19},   {0xFE30, 0xFE6B},   {0xFF01, 0xFF60},
    {0xFFE0, 0xFFE6},   {0x16FE0, 0x1B2FB}, {0x1F004, 0x1F004}, {0x1F0CF, 0x1F0CF}, {0x1F18E, 0x1F18E},
    {0x1F191, 0x1F19A}, {0x1F200, 0x1F320}, {0x1F32D, 0x1F335}, {0x1F337, 0x1F37C}, {0x1F37E, 0x1F393},
    {0x1F3A0, 0x1F3CA}, {0x1F3CF, 0x1F3D3}, {0x1F3E0, 0x1F3F0}, {0x1F3F4, 0x1F3F4}, {0x1F3F8, 0x1F43E},
    {0x1F440, 0x1F440}, {0x1F442, 0x1F4FC}, {0x1F4FF, 0x1F53D}, {0x1F54B, 0x1F54E}, {0x1F550, 0x1F567},
    {0x1F57A, 0x1F57A}, {0x1F595, 0x1F596}, {0x1F5A4, 0x1F5A4}, {0x1F5FB, 0x1F64F}, {0x1F680, 0x1F6C5},
    {0x1F6CC, 0x1F6CC}, {0x1F6D0, 0x1F6D2}, {0x1F6D5, 0x1F6DF}, {0x1F6EB, 0x1F6EC}, {0x1F6F4, 0x1F6FC},
    {0x1F7E0, 0x1F7F0}, {0x1F90C, 0x1F93A}, {0x1F93C, 0x1F945}, {0x1F947, 0x1F9FF}, {0x1FA70, 0x1FAF6},
    {0x20000, 0x3134A},
};

/// Default_Ignorable_Code_Point, in order, except the soft hyphen, which faces show as a hyphen.
constexpr Range ignorableRanges[] = {
    {0x034F, 0x034F}, {0x061C, 0x061C}, {0x180B, 0x180F}, {0x200B, 0x200F},   {0x202A, 0x202E},
    {0x2060, 0x206F}, {0xFE00, 0xFE0F}, {0xFEFF, 0xFEFF}, {0xE0000, 0xE0FFF},
};

template <std::size_t size>
bool isIn(const Range (&ranges)[size], char32_t character)
{
    const Range *range = std::upper_bound(std::begin(ranges), std::end(ranges), character,
                                          [](char32_t c, const Range &r) { return c < r.first; });
    return range != std::begin(ranges) && character <= std::prev(range)->last;
}

bool isJoiningHangul(char32_t character)
{
    return (character >= 0x1160 && character <= 0x11FF) || (character >= 0xD7B0 && character <= 0xD7FB);
}

char32_t characterAt(QStringView line, qsizetype at)
{
    return line[at].isHighSurrogate() && at + 1 < line.size() && line[at + 1].isLowSurrogate()
               ? QChar::surrogateToUcs4(line[at], line[at + 1])
               : line[at].unicode();
}

} // namespace

bool isIgnorable(char32_t character)
{
    return character >= ignorableRanges[0].first && isIn(ignorableRanges, character);
}

int cellsOf(char32_t character)
{
    if (character < 0x300) {
        return 1;
    }
    const QChar::Category category = QChar::category(character);
    if (category == QChar::Mark_NonSpacing || category == QChar::Mark_Enclosing || isJoiningHangul(character) ||
        isIgnorable(character))
    {
        return 0;
    }
    return isIn(wideRanges, character) ? 2 : 1;
}

qint64 cellsOf(QStringView line)
{
    qint64 cells = 0;
    for (qsizetype at = 0; at < line.size();) {
        const char32_t character = characterAt(line, at);
        cells += cellsOf(character);
        at += QChar::requiresSurrogates(character) ? 2 : 1;
    }
    return cells;
}

qsizetype clusterEnd(QStringView line, qsizetype begin)
{
    qsizetype at = begin;
    do {
        at += QChar::requiresSurrogates(characterAt(line, at)) ? 2 : 1;
    } while (at < line.size() && cellsOf(characterAt(line, at)) == 0);
    return at;
}

} // namespace kareport
