#include "TextPlaces.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <utility>

namespace
{

using kareport::TextPlace;
using kareport::TextPlaces;

struct Row
{
    QStringView text;
    qsizetype position;
    qsizetype line;
    qsizetype column;
    const char *reason;
};

template <std::size_t size>
void expectPlaces(const Row (&rows)[size])
{
    for (const Row &row : rows) {
        const TextPlace place = TextPlaces(row.text).of(row.position);
        EXPECT_EQ(std::pair(place.line, place.column), std::pair(row.line, row.column)) << row.reason;
    }
}

TEST(TextPlaces, LinesAndColumnsFromOne)
{
    constexpr Row rows[] = {
        {{}, 0, 1, 1, "a null text"},
        {u"", 0, 1, 1, "an empty text"},
        {u"abc", 0, 1, 1, "the first character"},
        {u"abc", 2, 1, 3, "the last character"},
        {u"abc", 3, 1, 4, "the end"},
        {u"abc", 99, 1, 4, "after the end: the end"},
        {u"", 5, 1, 1, "after the end of nothing"},
        {u"a\nb", 1, 1, 2, "a line end belongs to its line"},
        {u"a\nb", 2, 2, 1, "the first character of the next line"},
        {u"a\n", 2, 2, 1, "the end after a last line end"},
        {u"a\n", 9, 2, 1, "after a last line end"},
        {u"\n\n\n", 0, 1, 1, "empty lines: the first"},
        {u"\n\n\n", 1, 2, 1, "empty lines: the second"},
        {u"\n\n\n", 2, 3, 1, "empty lines: the third"},
        {u"\n\n\n", 3, 4, 1, "empty lines: the end"},
        {u"one\ntwo\nthree", 10, 3, 3, "inside a later line"},
        {u"a\r\nb", 1, 1, 2, "a CR is a character of its line"},
        {u"a\r\nb", 2, 1, 3, "the LF after it"},
        {u"a\r\nb", 3, 2, 1, "after both"},
        {u"a\rb", 2, 1, 3, "a CR alone ends no line"},
        {u"a\tb", 2, 1, 3, "a tab is one character"},
        {u"a\u2028b", 2, 1, 3, "other line separators end no line"},
    };
    expectPlaces(rows);
}

TEST(TextPlaces, ASurrogatePairIsOneCharacter)
{
    constexpr Row rows[] = {
        {u"測量x", 2, 1, 3, "characters of one unit"},
        {u"😀x", 0, 1, 1, "the pair itself"},
        {u"😀x", 2, 1, 2, "after one pair"},
        {u"a😀😀x", 5, 1, 4, "after two pairs"},
        {u"😀\n😀x", 5, 2, 2, "pairs of earlier lines do not count"},
        {u"😀\nx", 3, 2, 1, "the first of a line after a pair"},
        {u"x😀", 3, 1, 3, "the end after a pair"},
        {u"x😀", 9, 1, 3, "after the end"},
    };
    expectPlaces(rows);
}

TEST(TextPlaces, HalfASurrogatePairIsACharacterToo)
{
    const char16_t lowFirst[] = {0xDE00, u'x', u'y'};
    const char16_t highFirst[] = {0xD83D, u'x', u'y'};
    const char16_t swapped[] = {0xDE00, 0xD83D, u'x'};
    const Row rows[] = {
        {QStringView(highFirst, 3), 1, 1, 2, "after a high one alone"},
        {QStringView(lowFirst, 3), 1, 1, 2, "after a low one alone"},
        {QStringView(lowFirst, 3), 2, 1, 3, "further after a low one alone"},
        {QStringView(swapped, 3), 2, 1, 3, "in the wrong order they are two"},
    };
    expectPlaces(rows);
}

TEST(TextPlaces, InsideASurrogatePairIsThePlaceOfThePair)
{
    constexpr Row rows[] = {
        {u"😀x", 1, 1, 1, "the first character"},
        {u"ab\nc😀x", 5, 2, 2, "in a later line"},
    };
    expectPlaces(rows);
}

TEST(TextPlaces, OfManyLines)
{
    QString text;
    for (int i = 0; i < 10000; ++i) {
        text += QStringLiteral("line\n");
    }
    const TextPlaces places(text);
    for (const qsizetype line : {1, 2, 4999, 10000}) {
        const TextPlace place = places.of((line - 1) * 5 + 3);
        EXPECT_EQ(place.line, line);
        EXPECT_EQ(place.column, 4);
    }
    EXPECT_EQ(places.of(text.size()).line, 10001);
}

} // namespace
