#include "PdfText.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <string>

namespace
{

using kareport::visibleCharacters;
using kareport::visibleLine;

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
        {u"測\t量", u"測      量", "a wide character takes two columns"},
        {u"\xD83D\xDE00\tb", u"\xD83D\xDE00      b", "a pair is one character, and a wide one"},
        {u"e\u0301\tb", u"e\u0301       b", "a mark takes none"},
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

TEST(PdfText, KnowsTheCharactersThatAreSeen)
{
    struct Row
    {
        QStringView text;
        std::u32string expected;
        const char *reason;
    };
    const Row rows[] = {
        {u"", U"", "empty"},
        {u"ba\r\na\r\n", U"ab", "each once, in the order of codes, without line ends"},
        {u"\t\f\u007F\u0085\u2028\u2029", U"", "control characters and separators"},
        {u"é測é", U"é測", "any script"},
        {u"\xD83D\xDE00\uFFFF\xD83D\xDE00", U"\uFFFF\U0001F600", "pairs are one character"},
        {u"\xD83D\xD83D\xDE00\xDE00", U"\uFFFD\U0001F600", "halves are the sign for them"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(visibleCharacters(row.text), row.expected) << row.reason;
    }
    EXPECT_EQ(visibleCharacters(QLatin1StringView("b\xE9\r\n\xE9\x85")), U"b\u00E9") << "one byte a character";
}

TEST(PdfText, FindsTheLinesThatAreTooWide)
{
    struct Row
    {
        QStringView text;
        qint64 count;
        qint64 first;
        qint64 widest;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", 0, 0, 0, "nothing"},
        {u"12345678\r\n12345678", 0, 0, 0, "they fill the room"},
        {u"1\r\n123456789\r\n1\r\n1234567890\r\n", 2, 2, 10, "the first and the widest"},
        {u"12345678     \r\n", 0, 0, 0, "blanks at the end are not seen"},
        {u"1234567\tb\n", 1, 1, 9, "a tab leads past the room"},
        {u"a\t\n", 0, 0, 0, "a tab at the end is not seen"},
        {u"測測測測\n測測測測1", 1, 2, 9, "wide characters take two cells"},
        {u"1234567e\u0301\n", 0, 0, 0, "a mark takes none"},
        {u"1234567\U0001F600\n", 1, 1, 9, "a pair is one character, and a wide one"},
    };
    for (const Row &row : rows) {
        const kareport::WideLines found = kareport::wideLines(row.text, visibleCharacters(row.text), 8);
        EXPECT_EQ(found.count, row.count) << row.reason;
        EXPECT_EQ(found.first, row.first) << row.reason;
        EXPECT_EQ(found.widest, row.widest) << row.reason;
    }
    const QLatin1StringView narrow("1\r\n12345678\xE9\r\n");
    EXPECT_EQ(kareport::wideLines(narrow, visibleCharacters(narrow), 8).widest, 9) << "one byte a character";
}

} // namespace
