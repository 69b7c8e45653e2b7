#include "CharacterCells.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::cellsOf;
using kareport::clusterEnd;

TEST(CharacterCells, ACharacterTakesNoneOneOrTwo)
{
    struct Row
    {
        char32_t character;
        int cells;
        const char *reason;
    };
    constexpr Row rows[] = {
        {U'A', 1, "a letter"},
        {U'\u00E9', 1, "a letter with its mark"},
        {U'\u00AD', 1, "a soft hyphen, which faces show"},
        {U'\u03A9', 1, "Greek, ambiguous by the standard"},
        {U'\u2500', 1, "box drawing, ambiguous by the standard"},
        {U'\u0301', 0, "a mark above"},
        {U'\u0323', 0, "a mark below"},
        {U'\u20DD', 0, "a mark around"},
        {U'\u0903', 1, "a mark with room of its own"},
        {U'\u1100', 2, "a leading consonant"},
        {U'\u115F', 2, "the last of them"},
        {U'\u1160', 0, "a vowel joins it"},
        {U'\u11A8', 0, "and a final consonant"},
        {U'\u200B', 0, "a zero-width space"},
        {U'\u200D', 0, "a joiner"},
        {U'\uFE0F', 0, "a variation selector"},
        {U'\uFEFF', 0, "a byte-order mark"},
        {U'\u2E7F', 1, "before the CJK radicals"},
        {U'\u2E80', 2, "the first CJK radical"},
        {U'\u3000', 2, "a wide blank"},
        {U'\u303F', 1, "the half-fill space is narrow"},
        {U'\u6E2C', 2, "CJK"},
        {U'\uAC00', 2, "Hangul"},
        {U'\uD7A3', 2, "the last syllable"},
        {U'\uFF21', 2, "full width"},
        {U'\uFF61', 1, "half width"},
        {U'\u26A1', 2, "a sign of emoji presentation"},
        {U'\u2603', 1, "a sign of text presentation"},
        {U'\U0001F600', 2, "an emoji"},
        {U'\U0001D538', 1, "a letter beyond U+FFFF"},
        {U'\U00020BB7', 2, "CJK beyond U+FFFF"},
        {U'\U000E0101', 0, "a variation selector beyond U+FFFF"},
        {0x10FFFF, 1, "no character"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(cellsOf(row.character), row.cells) << row.reason;
    }
}

TEST(CharacterCells, AClusterIsACharacterWithWhatTakesNoCell)
{
    struct Row
    {
        QStringView line;
        std::vector<qsizetype> ends;
        qint64 cells;
        const char *reason;
    };
    const Row rows[] = {
        {u"ab", {1, 2}, 2, "letters"},
        {u"e\u0301x\u0323\u0304", {2, 5}, 2, "letters with marks"},
        {u"\u0301a", {1, 2}, 1, "a mark without a letter"},
        {u"\u1112\u1161\u11ABa", {3, 4}, 3, "a syllable in its parts"},
        {u"\xD83D\xDE00\uFE0F\u200D\xD83D\xDE00", {4, 6}, 4, "a pair with what directs it"},
        {u"\xD83D", {1}, 1, "half a pair"},
    };
    for (const Row &row : rows) {
        std::vector<qsizetype> ends;
        for (qsizetype at = 0; at < row.line.size();) {
            at = clusterEnd(row.line, at);
            ends.push_back(at);
        }
        EXPECT_EQ(ends, row.ends) << row.reason;
        EXPECT_EQ(cellsOf(row.line), row.cells) << row.reason;
    }
}

} // namespace
