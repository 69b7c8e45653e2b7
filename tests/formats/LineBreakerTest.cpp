#include "LineBreaker.h"

#include "PrintQt.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <random>

namespace
{

QStringList broken(QStringView line, double width, const kareport::CharacterWidth &characterWidth)
{
    std::vector<QStringView> pieces;
    kareport::breakLine(line, width, characterWidth, pieces);
    QStringList texts;
    for (const QStringView piece : pieces) {
        texts.append(piece.toString());
    }
    return texts;
}

/// A blank, a letter: 10; CJK and what is beyond U+FFFF: 20.
int usualWidth(char32_t character)
{
    return character >= 0x2E80 ? 20 : 10;
}

TEST(LineBreaker, BreaksAfterTheLastBlankThatReachesTheBox)
{
    struct Row
    {
        QStringView line;
        double width;
        QStringList expected;
        const char *reason;
    };
    const auto list = [](const char *pieces) { return QString::fromUtf8(pieces).split(u'|'); };
    const Row rows[] = {
        {u"", 50, list(""), "an empty line is one piece"},
        {u"a", 50, list("a"), "one character"},
        {u"abcde", 50, list("abcde"), "fills the box"},
        {u"abcdef", 50, list("abcde|f"), "a word wider than the box is broken at its edge"},
        {u"abcdefghijkl", 50, list("abcde|fghij|kl"), "several times"},
        {u"abcdef", 59.99, list("abcde|f"), "a hair too wide"},
        {u"ab cd ef", 50, list("ab cd |ef"), "a blank that crosses the edge takes no room"},
        {u"ab cdef", 50, list("ab |cdef"), "a word that does not fit goes to the next line"},
        {u"a b c d e", 50, list("a b c |d e"), "the last blank counts"},
        {u"ab cdefghij", 50, list("ab |cdefg|hij"), "a wide word gets a line of its own first"},
        {u"abcdefg hi", 50, list("abcde|fg hi"), "the rest of a wide word goes on as a line"},
        {u"abcde     ", 50, list("abcde     "), "blanks at the end need no line"},
        {u"     ", 20, list("     "), "nothing but blanks"},
        {u"ab cde    f", 50, list("ab |cde   | f"), "blanks that cross the edge before the last word"},
        {u"      abc", 50, list("      |abc"), "blanks in front are room that is taken"},
        {u"測量測量測", 50, list("測量|測量|測"), "wide characters"},
        {u"a測b量c測", 50, list("a測b|量c測"), "wide characters among others"},
        {u"a\xD83D\xDE00\xD83D\xDE00"
         u"b",
         50, list("a😀😀|b"), "a pair is never torn"},
        {u"\xD83D\xDE00\xD83D\xDE00\xD83D\xDE00", 30, list("😀|😀|😀"), "a pair is never torn"},
        {u"\xD83D\xD83D\xDE00", 25, {QStringLiteral("\xD83D"), QStringLiteral("😀")}, "half a pair before a whole one"},
        {u"abc", 5, list("a|b|c"), "a box narrower than a character still takes one a line"},
        {u"ab c", 0, list("a|b |c"), "no room at all"},
        {u"ab", -100, list("a|b"), "less than no room"},
        {u"\xD83D\xDE00"
         u"a",
         -1, list("😀|a"), "less than no room for a pair"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(broken(row.line, row.width, usualWidth), row.expected)
            << row.reason << ": " << testing::PrintToString(row.line);
    }
}

TEST(LineBreaker, CharactersWithoutWidthStayWithTheirLine)
{
    const auto width = [](char32_t character) { return character == u'\'' ? 0 : 10; };
    EXPECT_EQ(broken(u"abc''d", 30, width), (QStringList{QStringLiteral("abc''"), QStringLiteral("d")}));
    EXPECT_EQ(broken(u"''''", 0, width), QStringList{QStringLiteral("''''")});
}

TEST(LineBreaker, NothingIsLostAndNoPieceIsTooWide)
{
    std::mt19937 random(1);
    for (int round = 0; round < 2000; ++round) {
        QString line;
        const int length = static_cast<int>(random() % 60);
        for (int i = 0; i < length; ++i) {
            const char32_t characters[] = {U' ', U' ', U'a', U'b', U'測', U'😀'};
            line += QChar::fromUcs4(characters[random() % std::size(characters)]);
        }
        const int width = 20 + static_cast<int>(random() % 100);
        const QStringList pieces = broken(line, width, usualWidth);
        EXPECT_EQ(pieces.join(QString()), line) << width;
        for (qsizetype i = 0; i < pieces.size(); ++i) {
            QString piece = pieces[i];
            EXPECT_TRUE(!piece.isEmpty() || line.isEmpty());
            // Where the line is broken, blanks may cross the edge; the first that does is the break.
            while (piece.endsWith(u' ')) {
                piece.chop(1);
            }
            int used = 0;
            for (const char32_t character : piece.toUcs4()) {
                used += usualWidth(character);
            }
            EXPECT_LE(used, width) << testing::PrintToString(line);
        }
    }
}

} // namespace
