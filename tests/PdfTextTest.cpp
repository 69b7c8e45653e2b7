#include "PdfText.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <string>

namespace
{

using kareport::pageEnd;
using kareport::visibleCharacters;
using kareport::visibleLine;

TEST(PdfText, APageEndsBehindItsLastLineFeed)
{
    struct Row
    {
        const char *text;
        qsizetype begin;
        int lines;
        qsizetype expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", 0, 60, 0, "empty"},
        {"a\r\nb\r\n", 0, 1, 3, "one line"},
        {"a\r\nb\r\n", 3, 1, 6, "the next one"},
        {"a\r\nb\r\n", 0, 2, 6, "all lines"},
        {"a\r\nb\r\n", 0, 60, 6, "fewer lines than a page has"},
        {"a\r\nb\r\n", 6, 60, 6, "nothing is left"},
        {"a\nb", 0, 2, 3, "the last line has no end"},
        {"a\rb\n", 0, 1, 4, "a lone CR ends nothing"},
        {"\n\n\n", 0, 2, 2, "empty lines"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(pageEnd(QLatin1StringView(row.text), row.begin, row.lines), row.expected) << row.reason;
        EXPECT_EQ(pageEnd(QStringView(QString::fromLatin1(row.text)), row.begin, row.lines), row.expected)
            << row.reason;
    }
}

struct LineRow
{
    QStringView line;
    QStringView expected;
    const char *reason;
};

TEST(PdfText, ALineIsWhatIsSeenOfIt)
{
    constexpr LineRow rows[] = {
        {u"", u"", "empty"},
        {u"a b", u"a b", "nothing to do"},
        {u"a\r", u"a", "the CR before its line feed"},
        {u"a\rb", u"ab", "a lone CR draws nothing"},
        {u"a  ", u"a", "blanks at the end are not seen"},
        {u"a  \r", u"a", "nor those before the line end"},
        {u"   ", u"", "nothing but blanks"},
        {u"  a", u"  a", "blanks in front stay"},
        {u"\ta", u"        a", "a tab leads to column 8"},
        {u"a\tb", u"a       b", "from the next column on"},
        {u"1234567\tb", u"1234567 b", "one blank at least"},
        {u"12345678\tb", u"12345678        b", "a whole step at a full column"},
        {u"a\t\tb", u"a               b", "two tabs"},
        {u"a\t", u"a", "a tab at the end is not seen"},
        {u"\u0001\u0002\tb", u"        b", "what is not seen takes no column"},
        {u"a\f\v\b\u001B\u007F\u0085\u009Fb", u"ab", "control characters"},
        {QStringView(u"a\0b", 3), u"ab", "a zero ends nothing"},
        {u"\u00A0é°\u00FF", u"\u00A0é°\u00FF", "the upper half of Latin-1; a blank that does not break is seen"},
    };
    QString visible = QStringLiteral("what was there before");
    for (const LineRow &row : rows) {
        visibleLine(row.line, visible);
        EXPECT_EQ(visible, row.expected.toString()) << row.reason;
        visibleLine(QLatin1StringView(row.line.toLatin1()), visible);
        EXPECT_EQ(visible, row.expected.toString()) << row.reason << ", one byte a character";
    }
}

TEST(PdfText, ALineOfWideCharactersIsWhatIsSeenOfIt)
{
    constexpr LineRow rows[] = {
        {u"a\u2028b\u2029c", u"abc", "line and paragraph separators end nothing"},
        {u"測\t量", u"測       量", "a character is a column, however wide"},
        {u"\xD83D\xDE00\tb", u"\xD83D\xDE00       b", "a pair is one character"},
        {u"a\xD83D", u"a\uFFFD", "half a pair at the end"},
        {u"\xDE00\xD83D", u"\uFFFD\uFFFD", "the halves in the wrong order"},
        {u"\xD83D\xD83D\xDE00", u"\uFFFD\xD83D\xDE00", "half a pair before a whole one"},
        {u"\xD83D\tb", u"\uFFFD       b", "half a pair before a tab"},
        {u"a\u3000", u"a\u3000", "a wide blank stays"},
    };
    QString visible;
    for (const LineRow &row : rows) {
        visibleLine(row.line, visible);
        EXPECT_EQ(visible, row.expected.toString()) << row.reason;
    }
}

std::string listOf(const std::vector<kareport::CharacterCount> &counts)
{
    std::string list;
    for (const kareport::CharacterCount &entry : counts) {
        list += (list.empty() ? "" : " ") + QString::number(entry.character, 16).toStdString() + "*" +
                std::to_string(entry.count);
    }
    return list;
}

TEST(PdfText, CountsWhatIsSeen)
{
    struct Row
    {
        QStringView text;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", "", "empty"},
        {u"ba\r\na\r\n", "61*2 62*1", "in the order of codes, without line ends"},
        {u"\t\f\u007F\u0085\u2028\u2029", "", "control characters and separators"},
        {u"é測é", "e9*2 6e2c*1", "any script"},
        {u"\xD83D\xDE00\uFFFF\xD83D\xDE00", "ffff*1 1f600*2", "pairs are one character"},
        {u"\xD83D\xD83D\xDE00\xDE00", "fffd*2 1f600*1", "halves are the sign for them"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(listOf(visibleCharacters(row.text)), row.expected) << row.reason;
    }
    EXPECT_EQ(listOf(visibleCharacters(QLatin1StringView("b\xE9\r\n\xE9\x85"))), "62*1 e9*2") << "one byte a character";
}

} // namespace
