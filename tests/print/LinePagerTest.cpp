#include "LinePager.h"

#include "PagedText.h"
#include "PrintQt.h"

#include <QTextCursor>

#include <gmock/gmock.h>

namespace
{

using testing::ElementsAre;

QString utf16(const char16_t *text)
{
    return QString::fromUtf16(text);
}

TEST(LinePager, TakesAsManyLinesAsFit)
{
    struct Row
    {
        int lines;
        int perPage;
        std::vector<qint64> starts;
        const char *reason;
    };
    const Row rows[] = {
        {0, 3, {0}, "an empty text"},
        {1, 3, {0}, "one line"},
        {3, 3, {0}, "a full page; the line after the last line's end takes no page"},
        {4, 3, {0, 15}, "one line more"},
        {7, 3, {0, 15, 30}, "two full pages and a line"},
        {3, 1, {0, 5, 10}, "a line a page"},
    };
    for (const Row &row : rows) {
        PagedText text(shortLines(row.lines));
        EXPECT_EQ(text.starts(PagedText::room(row.perPage, 80)), row.starts) << row.reason;
    }
}

TEST(LinePager, AnswersTheFirstCharacterThatDidNotFit)
{
    PagedText text(QStringLiteral("abc\n\nde\nfghi")); // lines begin at 0, 4, 5 and 8; 12 characters
    const QRect twoLines = PagedText::room(2, 80);
    struct Row
    {
        qint64 start;
        qint64 stop;
        qint64 next;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, -1, 5, "two lines, one of them empty"},
        {5, -1, 12, "to the end"},
        {4, -1, 8, "from an empty line"},
        {1, -1, 5, "from the middle of a line"},
        {3, -1, 5, "from the end of a line, which is a line as well"},
        {8, -1, 12, "the last line"},
        {0, 2, 2, "up to the middle of a line"},
        {0, 5, 5, "up to a line's start"},
        {0, 100, 5, "a stop past the end is the end"},
        {0, 12, 5, "a stop at the end"},
        {5, 5, 5, "nothing asked for"},
        {6, 5, 6, "a stop in front of the start"},
        {12, -1, 12, "past the last character"},
        {99, -1, 99, "far past it"},
        {-1, -1, -1, "in front of the first"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(text.pager().layOut(twoLines, row.start, row.stop), row.next) << row.reason;
    }
    EXPECT_EQ(text.pager().length(), 12);
}

TEST(LinePager, LongLinesGoOnInTheNextRow)
{
    struct Row
    {
        QString text;
        std::vector<qint64> starts;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("1234567890\nx"), {0, 11}, "fits exactly"},
        {QStringLiteral("12345678901\nx"), {0, 10, 12}, "one character more goes into a row of its own"},
        {QStringLiteral("1234 67890 2345\nx"), {0, 11, 16}, "broken at a blank, which stays with its word"},
        {QStringLiteral("x\n\n1234567890123456789012345"), {0, 2, 3, 13, 23}, "a long last line"},
        {QStringLiteral("1234567890       6"), {0, 17}, "blanks at a row's end are in the margin"},
    };
    for (const Row &row : rows) {
        PagedText text(row.text);
        EXPECT_EQ(text.starts(PagedText::room(1, 10)), row.starts) << row.reason;
    }
}

TEST(LinePager, TabsAreWhereTheScreenHasThem)
{
    PagedText text(QStringLiteral("a\tb\nc"));
    // 80 pixels of a screen of 96 dots per inch are 500 dots of 600: twelve characters and a half.
    EXPECT_EQ(text.starts(PagedText::room(1, 14)), (std::vector<qint64>{0, 4})) << "the tab and a character";
    EXPECT_EQ(text.starts(PagedText::room(1, 13)).size(), 3U) << "the character goes into a row of its own";
}

TEST(LinePager, NeverBreaksACharacterInTwo)
{
    PagedText text(utf16(u"\U0001F600").repeated(5000)); // a line without end, of pairs
    const std::vector<qint64> starts = text.starts(PagedText::room(3, 33));
    EXPECT_GT(starts.size(), 20U);
    for (const qint64 start : starts) {
        EXPECT_EQ(start % 2, 0) << start;
    }
}

TEST(LinePager, APageMayBeginWithinALongLine)
{
    PagedText text(QStringLiteral("words and words ").repeated(125'000));
    const qint64 next = text.pager().layOut(PagedText::room(50, 100), 1'000'000, -1);
    EXPECT_GT(next, 1'004'000);
    EXPECT_LE(next, 1'005'000) << "50 rows of 100 characters";
}

TEST(LinePager, APageTakesOneRowAtLeast)
{
    PagedText text(shortLines(3));
    EXPECT_THAT(text.starts(QRect(567, 567, 1000, 10)), ElementsAre(0, 5, 10)) << "lower than a line";
    EXPECT_EQ(text.pager().layOut(QRect(567, 567, 1000, 0), 0, -1), 0) << "no room at all";
    EXPECT_EQ(text.pager().layOut(QRect(567, 567, -10, 1000), 0, -1), 0) << "margins wider than the paper";
    EXPECT_EQ(text.starts(QRect(567, 567, 10, 10'000)).size(), 1U) << "narrower than a character: one a row";
}

TEST(LinePager, RoundingsDoNotTakeALineFromAPage)
{
    // 80 lines are 6240 dots, which are 14976 twips.
    struct Row
    {
        int height;
        int usual;
        qint64 lines;
        const char *reason;
    };
    constexpr Row rows[] = {
        {14976, 80, 80, "exactly"},
        {14974, 80, 80, "a rounding less"},
        {14974, 0, 79, "nothing is known of the pages that the text was written for"},
        {14960, 80, 79, "less than roundings explain"},
        {15163, 80, 80, "81 lines by a rounding: 15163 twips are 6317.9 dots"},
        {15165, 80, 80, "a little over 81 lines"},
        {15165, 0, 81, "nothing is known"},
        {15180, 80, 81, "more than roundings explain"},
        {20000, 80, 106, "a page that was written for fewer lines than fit"},
        {20000, -3, 106, "no usual page"},
    };
    PagedText text(shortLines(200));
    for (const Row &row : rows) {
        kareport::LinePager pager = text.pager();
        pager.setUsualLines(row.usual);
        EXPECT_EQ(pager.layOut(QRect(0, 0, 10'000, row.height), 0, -1), row.lines * 5) << row.reason;
    }
}

TEST(LinePager, ALineIsAsHighAsItsLargestCharacters)
{
    PagedText text(shortLines(4));
    QTextCursor cursor(&text.document());
    cursor.setPosition(5 + 1);
    cursor.setPosition(5 + 2, QTextCursor::KeepAnchor);
    QTextCharFormat large;
    large.setFontPointSize(16); // 133 dots: 123 + 31 high
    cursor.mergeCharFormat(large);
    EXPECT_EQ(text.pager().layOut(PagedText::room(3, 80), 0, -1), 10) << "78 + 154 dots, and 2 are left of 3 * 78";
    EXPECT_EQ(text.pager().layOut(PagedText::room(4, 80), 0, -1), 15);
    EXPECT_EQ(text.pager().layOut(PagedText::room(3, 80), 10, -1), 20) << "the lines after are as before";
}

TEST(LinePager, CountsAlikeWhetherItDrawsOrNot)
{
    PagedText text(QStringLiteral("short\n\nwith\ttab\n") + utf16(u"測量 äöü °\n") +
                   QStringLiteral("a line that is longer than a row ").repeated(9) + utf16(u"\nשלום mixed\n") +
                   shortLines(40));
    const QRect page = PagedText::room(6, 30);
    const std::vector<qint64> starts = text.starts(page);
    ASSERT_GT(starts.size(), 5U);
    QPainter painter(&text.printer());
    for (std::size_t i = 0; i + 1 < starts.size(); ++i) {
        EXPECT_EQ(text.pager().layOut(page, starts[i], -1, &painter), starts[i + 1]) << i;
    }
}

} // namespace
