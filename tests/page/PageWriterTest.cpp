#include "PageWriter.h"

#include "LimitedMemory.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using kareport::PageWriter;

QString lineEnds(int count)
{
    return QStringLiteral("\r\n").repeated(count);
}

QString withLineEnds(const char16_t *text)
{
    return QString::fromUtf16(text).replace(u'\n', QStringLiteral("\r\n"));
}

/// A writer with what it has written since it was put to a line of page 2.
struct WriterAtLine
{
    WriterAtLine(int linesPerPage, int line)
    {
        writer.newPage(0);
        writer.lineFeed(1);
        writer.newPage(-1);
        writer.setLinesPerPage(linesPerPage);
        writer.lineFeed(line - 1);
        before = writer.text().size();
    }
    QString written() const { return writer.text().view().sliced(before).toString(); }

    PageWriter writer;
    qint64 before = 0;
};

TEST(PageWriter, BeginsEmptyWithSeventyTwoLinesAPage)
{
    const PageWriter writer;
    EXPECT_EQ(writer.text().size(), 0);
    EXPECT_EQ(writer.lineNumber(), 0);
    EXPECT_EQ(writer.lineCount(), 0);
    EXPECT_EQ(writer.pageNumber(), 0);
    EXPECT_EQ(writer.linesPerPage(), 72);
    EXPECT_FALSE(writer.headerFlag());
    EXPECT_EQ(writer.heading().text, QString());
    EXPECT_EQ(writer.heading().linesBefore, 0);
    EXPECT_EQ(writer.heading().linesAfter, 0);
}

TEST(PageWriter, TheFirstPageBeginsWhateverIsNeeded)
{
    for (const int needed : {0, 1, 71, 72, 1000, -1, std::numeric_limits<int>::min()}) {
        PageWriter writer;
        EXPECT_TRUE(writer.newPage(needed)) << needed;
        EXPECT_EQ(writer.pageNumber(), 1) << needed;
        EXPECT_EQ(writer.lineNumber(), 1) << needed;
        EXPECT_EQ(writer.lineCount(), 0) << needed;
        EXPECT_EQ(writer.text().size(), 0) << needed;
    }
}

TEST(PageWriter, BreaksThePageWhenTheLinesNeededAndOneMoreDoNotFit)
{
    constexpr int most = std::numeric_limits<int>::max();
    constexpr int least = std::numeric_limits<int>::min();
    struct Row
    {
        int linesPerPage;
        int line;
        int needed;
        int lineEndsWritten; ///< -1: no new page
        const char *reason;
    };
    constexpr Row rows[] = {
        {72, 70, 0, -1, "two lines left, none needed"},
        {72, 70, 1, -1, "one needed of two that are left"},
        {72, 70, 2, 3, "as many needed as are left"},
        {72, 71, 0, -1, "the line before the last takes a line"},
        {72, 71, 1, 2, "one needed, one left"},
        {72, 72, 0, 1, "nothing left on the last line"},
        {72, 72, 5, 1, "nothing left on the last line"},
        {72, 72, -1, 1, "a negative number at the page's end breaks it once"},
        {72, 2, 69, -1, "nearly a whole page"},
        {72, 2, 70, 71, "one too many for an almost empty page"},
        {72, 2, -1, 71, "a negative number always breaks"},
        {72, 1, -1, 72, "a negative number breaks an empty page as well"},
        {72, 40, least, 33, "the least number of all"},
        {72, 40, most, 33, "the largest number of all"},
        {72, 73, 0, 0, "beyond the page's end there is nothing to run out"},
        {72, 80, 5, 0, "far beyond the page's end"},
        {72, 80, -1, 0, "far beyond the page's end, forced"},
        {1, 1, 0, 1, "a page of one line is full at its first"},
        {1, 2, 0, 0, "beyond a page of one line"},
        {2, 1, 0, -1, "a page of two lines takes one"},
        {2, 1, 1, 2, "a page of two lines does not take two"},
    };
    for (const Row &row : rows) {
        WriterAtLine at(row.linesPerPage, row.line);
        ASSERT_EQ(at.writer.lineNumber(), row.line) << row.reason;
        const int count = at.writer.lineCount();
        const bool breaks = row.lineEndsWritten >= 0;
        EXPECT_EQ(at.writer.newPage(row.needed), breaks) << row.reason;
        EXPECT_EQ(at.written(), lineEnds(row.lineEndsWritten)) << row.reason;
        EXPECT_EQ(at.writer.pageNumber(), breaks ? 3 : 2) << row.reason;
        EXPECT_EQ(at.writer.lineNumber(), breaks ? 1 : row.line) << row.reason;
        EXPECT_EQ(at.writer.lineCount(), breaks ? count + row.lineEndsWritten : count) << row.reason;
    }
}

TEST(PageWriter, LineFeedsEndTheLineSoManyTimes)
{
    struct Row
    {
        int count;
        int written;
    };
    constexpr Row rows[] = {{0, 0}, {-1, 0}, {std::numeric_limits<int>::min(), 0}, {1, 1}, {3, 3}, {100, 100}};
    for (const Row &row : rows) {
        PageWriter writer;
        writer.lineFeed(row.count);
        EXPECT_EQ(writer.text().view().toString(), lineEnds(row.written)) << row.count;
        EXPECT_EQ(writer.lineNumber(), row.written) << row.count;
        EXPECT_EQ(writer.lineCount(), row.written) << row.count;
        EXPECT_EQ(writer.pageNumber(), 0) << "line feeds alone never begin a page";
    }
}

TEST(PageWriter, WritingCountsTheLineFeedsOfTheText)
{
    struct Row
    {
        const char16_t *text;
        int lines;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", 0, "nothing"},
        {u"a text without line feeds", 0, "line number and line count stay"},
        {u"\r", 0, "a carriage return is not a line feed"},
        {u"a\r\nb\r\n", 2, "two lines"},
        {u"a\nb", 1, "a line feed alone"},
        {u"\n\n\n", 3, "line feeds only"},
        {u"\f\v\x2028\x0A0A", 0, "no other character ends a line"},
        {u"\xD83D\xDE00\n\x6E2C", 1, "beside a surrogate pair"},
    };
    for (const Row &row : rows) {
        WriterAtLine at(72, 10);
        const int count = at.writer.lineCount();
        EXPECT_TRUE(at.writer.write(row.text, 0)) << row.reason;
        EXPECT_EQ(at.written(), QString::fromUtf16(row.text)) << row.reason;
        EXPECT_EQ(at.writer.lineNumber(), 10 + row.lines) << row.reason;
        EXPECT_EQ(at.writer.lineCount(), count + row.lines) << row.reason;
        EXPECT_EQ(at.writer.pageNumber(), 2) << row.reason;
    }
}

TEST(PageWriter, ALineHasBlankLinesBeforeAndLineEndsAfterIt)
{
    struct Row
    {
        int line;
        int before;
        int after;
        QString expected;
        int pageAfter;
        int lineAfter;
        const char *reason;
    };
    const Row rows[] = {
        {10, 0, 0, QStringLiteral("x"), 2, 10, "0 and 0 leave the line open"},
        {10, 0, 1, QStringLiteral("x\r\n"), 2, 11, "0 and 1 write one complete line"},
        {10, 1, 2, QStringLiteral("\r\nx\r\n\r\n"), 2, 13, "1 and 2 give a blank line above and one below"},
        {10, 0, 3, QStringLiteral("x\r\n\r\n\r\n"), 2, 13, "two blank lines below"},
        {10, 2, 0, QStringLiteral("\r\n\r\nx"), 2, 12, "blank lines above an open line"},
        {10, 0, -1, QStringLiteral("x\r\n") + lineEnds(62), 3, 1, "a negative number after ends line and page"},
        {10, -1, 1, lineEnds(63) + QStringLiteral("x\r\n"), 3, 2, "a negative number before breaks the page"},
        {10, -3, 0, lineEnds(63) + QStringLiteral("x"), 3, 1, "however negative, one page break"},
        {70, 1, 0, QStringLiteral("\r\nx"), 2, 71, "at line 70 one blank line before still fits"},
        {71, 1, 1, lineEnds(2) + QStringLiteral("x\r\n"), 3, 2,
         "at line 71 the page breaks, its blank line is dropped"},
        {70, 1, 1, QStringLiteral("\r\nx\r\n\r\n"), 3, 1, "the line end reaches the last line and turns the page"},
        {71, 0, 1, QStringLiteral("x\r\n\r\n"), 3, 1, "the last line that is written on a page"},
        {71, 0, 0, QStringLiteral("x"), 2, 71, "an open line does not turn the page"},
        {72, 0, 0, QStringLiteral("\r\nx"), 3, 1, "the page's last line takes no text"},
        {69, 0, 2, QStringLiteral("x\r\n\r\n"), 2, 71, "one blank line of the two lines that are left"},
        {70, 0, 2, QStringLiteral("x\r\n\r\n\r\n"), 3, 1, "no room for the blank line: it is dropped with the page"},
        {10, 62, 1, lineEnds(63) + QStringLiteral("x\r\n"), 3, 2, "as many blank lines before as lines are left"},
        {10, 61, 0, lineEnds(61) + QStringLiteral("x"), 2, 71, "one blank line less fits"},
    };
    for (const Row &row : rows) {
        WriterAtLine at(72, row.line);
        at.writer.writeLine(u"x", row.before, row.after, 0);
        EXPECT_EQ(at.written(), row.expected) << row.reason;
        EXPECT_EQ(at.writer.pageNumber(), row.pageAfter) << row.reason;
        EXPECT_EQ(at.writer.lineNumber(), row.lineAfter) << row.reason;
    }
}

TEST(PageWriter, TheFirstLineDropsTheBlankLinesBeforeIt)
{
    for (const int before : {0, 1, 5, 100, -1}) {
        PageWriter writer;
        writer.writeLine(u"x", before, 1, 0);
        EXPECT_EQ(writer.text().view().toString(), QStringLiteral("x\r\n")) << before;
        EXPECT_EQ(writer.pageNumber(), 1) << before;
        EXPECT_EQ(writer.lineNumber(), 2) << before;
        EXPECT_EQ(writer.lineCount(), 1) << before;
    }
}

TEST(PageWriter, OpenLinesAreContinued)
{
    PageWriter writer;
    writer.writeLine(u"a", 0, 0, 0);
    writer.writeLine(u"", 0, 0, 0);
    writer.writeLine(u"b", 0, 0, 0);
    EXPECT_EQ(writer.lineCount(), 0) << "no line is complete yet";
    writer.writeLine(u"c", 0, 1, 0);
    writer.writeLine(u"d", 0, 0, 0);
    writer.writeLine(u"", 0, 2, 0);
    EXPECT_EQ(writer.text().view().toString(), QStringLiteral("abc\r\nd\r\n\r\n"));
    EXPECT_EQ(writer.pageNumber(), 1);
    EXPECT_EQ(writer.lineNumber(), 4);
    EXPECT_EQ(writer.lineCount(), 3);
}

TEST(PageWriter, PagesOfAFewLinesLeaveTheirLastLineBlank)
{
    struct Row
    {
        int linesPerPage;
        const char16_t *expected;
        int page;
        int line;
        const char *reason;
    };
    constexpr Row rows[] = {
        {1, u"a\n\nb\n\nc\n", 6, 1, "each line runs over its page and the next page is full at its first line"},
        {2, u"a\n\nb\n\nc\n\n", 4, 1, "one line a page"},
        {3, u"a\nb\n\nc\n", 2, 2, "two lines a page"},
        {4, u"a\nb\nc\n\n", 2, 1, "the third line turns the page"},
        {5, u"a\nb\nc\n", 1, 4, "room for one more"},
    };
    for (const Row &row : rows) {
        PageWriter writer;
        writer.setLinesPerPage(row.linesPerPage);
        for (const QStringView line : {QStringView(u"a"), QStringView(u"b"), QStringView(u"c")}) {
            writer.writeLine(line, 0, 1, 0);
        }
        EXPECT_EQ(writer.text().view().toString(), withLineEnds(row.expected)) << row.linesPerPage << row.reason;
        EXPECT_EQ(writer.pageNumber(), row.page) << row.linesPerPage << row.reason;
        EXPECT_EQ(writer.lineNumber(), row.line) << row.linesPerPage << row.reason;
    }
}

TEST(PageWriter, WithoutMemoryNothingIsWrittenOrCounted)
{
    const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
    PageWriter writer(nullptr, LimitedMemory::reallocate);
    writer.newPage(0);
    ASSERT_TRUE(writer.write(QString(31990, u'x'), 0));
    EXPECT_FALSE(writer.write(u"1234567890\n", 0));
    EXPECT_EQ(writer.text().size(), 31990);
    EXPECT_EQ(writer.lineNumber(), 1);
    EXPECT_EQ(writer.lineCount(), 0);

    writer.lineFeed(10);
    EXPECT_EQ(writer.text().narrowView().sliced(31990).toString(), lineEnds(4))
        << "a fifth one asks for 32001 characters";
    EXPECT_EQ(writer.lineNumber(), 5);
    EXPECT_EQ(writer.lineCount(), 4);

    memory.largest = LimitedMemory::bytesFor(1000000);
    writer.writeLine(u"y", 0, 1, 0);
    EXPECT_EQ(writer.text().view().sliced(31998).toString(), QStringLiteral("y\r\n")) << "usable again";
}

} // namespace
