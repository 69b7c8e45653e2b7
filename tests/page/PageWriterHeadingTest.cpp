#include "PageWriter.h"

#include "LimitedMemory.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::PageWriter;

QString withLineEnds(const char16_t *text)
{
    return QString::fromUtf16(text).replace(u'\n', QStringLiteral("\r\n"));
}

TEST(PageWriterHeading, APageBeginsWithHeaderGapAndHeading)
{
    struct Row
    {
        const char16_t *heading;
        int before;
        int after;
        const char16_t *expected;
        int line;
        int count;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", 0, 0, u"H  1\n\n\n\n", 5, 4, "three blank lines; the first data line is the page's fifth"},
        {u"a", 0, 0, u"H  1\n\n\n\na", 5, 4, "a heading without line ends stays open"},
        {u"a", 1, 2, u"H  1\n\n\n\n\na\n\n", 8, 7, "lines before come on top of the gap"},
        {u"", 0, 2, u"H  1\n\n\n\n\n\n", 7, 6, "lines after an empty heading"},
        {u"a", -2, 1, u"H  1\n\na\n", 4, 3, "fewer lines before eat into the gap"},
        {u"a", -4, -1, u"H  1a", 1, 0, "no gap left, and nothing for less than no lines"},
        {u"a", -9, 1, u"H  1a\n", 2, 1, "less than no gap"},
        {u"a\nb", 0, 1, u"H  1\n\n\n\na\nb\n", 8, 7, "a line feed inside counts twice: 6 lines on the page, 7 counted"},
        {u"a\nb\nc", 0, 0, u"H  1\n\n\n\na\nb\nc", 9, 8, "two line feeds inside: 6 lines, 8 counted"},
        {u"\n", 0, 0, u"H  1\n\n\n\n\n", 7, 6, "a line feed alone counts twice"},
    };
    for (const Row &row : rows) {
        PageWriter writer;
        writer.setHeaderFlag(true);
        writer.setHeaderLine(QStringLiteral("H"));
        writer.setHeading({withLineEnds(row.heading), row.before, row.after});
        EXPECT_TRUE(writer.newPage(0)) << row.reason;
        EXPECT_EQ(writer.text().view().toString(), withLineEnds(row.expected)) << row.reason;
        EXPECT_EQ(writer.lineNumber(), row.line) << row.reason;
        EXPECT_EQ(writer.lineCount(), row.count) << row.reason;
        EXPECT_EQ(writer.pageNumber(), 1) << row.reason;
    }
}

TEST(PageWriterHeading, ACarriageReturnInsideIsNotCounted)
{
    PageWriter writer;
    writer.setHeaderFlag(true);
    writer.setHeading({QStringLiteral("a\rb"), 0, 0});
    writer.newPage(0);
    EXPECT_EQ(writer.lineNumber(), 5);
}

TEST(PageWriterHeading, EveryPageHasTheHeaderWithItsNumber)
{
    PageWriter writer;
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("%1 %2"));
    struct Row
    {
        int page;
        const char16_t *expected;
    };
    constexpr Row rows[] = {{1, u"%1 %2  1\n\n\n\n"},   {2, u"%1 %2  2\n\n\n\n"},    {9, u"%1 %2  9\n\n\n\n"},
                            {10, u"%1 %2 10\n\n\n\n"},  {99, u"%1 %2 99\n\n\n\n"},   {100, u"%1 %2100\n\n\n\n"},
                            {999, u"%1 %2999\n\n\n\n"}, {1000, u"%1 %21000\n\n\n\n"}};
    for (const Row &row : rows) {
        while (writer.pageNumber() < row.page) {
            ASSERT_TRUE(writer.newPage(-1));
        }
        const QString expected = withLineEnds(row.expected);
        EXPECT_EQ(writer.text().view().last(expected.size()).toString(), expected) << row.page;
    }
}

TEST(PageWriterHeading, TheSecondPageRepeatsTheHeading)
{
    PageWriter writer;
    writer.setLinesPerPage(10);
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.setHeading({QStringLiteral("Point"), 0, 2});
    for (const QStringView line : {QStringView(u"1"), QStringView(u"2"), QStringView(u"3"), QStringView(u"4")}) {
        writer.writeLine(line, 0, 1, 0);
    }
    EXPECT_EQ(writer.text().view().toString(),
              withLineEnds(u"H  1\n\n\n\nPoint\n\n1\n2\n3\n\nH  2\n\n\n\nPoint\n\n4\n"));
    EXPECT_EQ(writer.lineNumber(), 8);
    EXPECT_EQ(writer.lineCount(), 17);
}

TEST(PageWriterHeading, ANegativeNeedBreaksAPageThatIsEmptyBelowItsHeader)
{
    PageWriter writer;
    writer.setLinesPerPage(6);
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.newPage(0);
    EXPECT_TRUE(writer.newPage(-1));
    EXPECT_EQ(writer.text().view().toString(), withLineEnds(u"H  1\n\n\n\n\n\nH  2\n\n\n\n"));
    EXPECT_EQ(writer.pageNumber(), 2);
    EXPECT_EQ(writer.lineNumber(), 5);
}

TEST(PageWriterHeading, APageThatItsHeaderFillsTurnsWithEveryLine)
{
    PageWriter writer;
    writer.setLinesPerPage(5);
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.writeLine(u"a", 0, 1, 0);
    EXPECT_EQ(writer.text().view().toString(), withLineEnds(u"H  1\n\n\n\na\nH  2\n\n\n\n"))
        << "line 6 of a page of 5: nothing to run out";
    writer.writeLine(u"b", 0, 1, 0);
    EXPECT_EQ(writer.text().view().toString(),
              withLineEnds(u"H  1\n\n\n\na\nH  2\n\n\n\n\nH  3\n\n\n\nb\nH  4\n\n\n\n"))
        << "page 2 is full below its header";
}

TEST(PageWriterHeading, AnOpenFirstLineHasOneHeader)
{
    PageWriter writer;
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.writeLine(u"a", 3, 0, 0);
    writer.writeLine(u"b", 0, 1, 0);
    EXPECT_EQ(writer.text().view().toString(), withLineEnds(u"H  1\n\n\n\nab\n"));
}

TEST(PageWriterHeading, WritingTheHeadingNeverBreaksThePageAndCountsItsLineFeedsOnce)
{
    PageWriter writer;
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.setLinesPerPage(7);
    writer.newPage(0);
    writer.lineFeed(1);
    ASSERT_EQ(writer.lineNumber(), 6);
    const qint64 before = writer.text().size();
    writer.setHeading({QStringLiteral("a\r\nb"), 2, 1});
    writer.writeHeading();
    EXPECT_EQ(writer.text().view().sliced(before).toString(), withLineEnds(u"\n\na\nb\n"));
    EXPECT_EQ(writer.lineNumber(), 10);
    EXPECT_EQ(writer.pageNumber(), 1);
}

TEST(PageWriterHeading, ClearingEmptiesTextAndHeadingAndBeginsPageOneWithTheNextLine)
{
    PageWriter writer;
    writer.setLinesPerPage(10);
    writer.setHeaderFlag(true);
    writer.setHeaderLine(QStringLiteral("H"));
    writer.setHeading({QStringLiteral("Point"), 1, 1});
    writer.newPage(0);
    writer.newPage(-1);
    writer.clear();
    EXPECT_EQ(writer.text().size(), 0);
    EXPECT_EQ(writer.lineCount(), 0);
    EXPECT_EQ(writer.lineNumber(), 7) << "stays until the next page";
    EXPECT_EQ(writer.pageNumber(), 2) << "stays until the next page";
    EXPECT_EQ(writer.heading().text, QString());
    writer.writeLine(u"x", 4, 1, 0);
    EXPECT_EQ(writer.text().view().toString(), withLineEnds(u"H  1\n\n\n\n\n\nx\n"))
        << "the lines around the heading stay";
    EXPECT_EQ(writer.pageNumber(), 1);
    EXPECT_EQ(writer.lineNumber(), 8);
}

/// Records its notifications.
class Recorder : public kareport::PageWriterObserver
{
public:
    bool textWritten(QStringView text, int style) override
    {
        calls += QStringLiteral("[%1 %2]").arg(style).arg(text.toString());
        return hasMemory;
    }
    bool lineEnded() override
    {
        calls += u'/';
        return hasMemory;
    }
    void changed() override { calls += u'!'; }
    QString calls;
    bool hasMemory = true;
};

TEST(PageWriterHeading, TheObserverIsToldEveryPieceInOrder)
{
    Recorder recorder;
    PageWriter writer(&recorder);
    const auto told = [&] { return std::exchange(recorder.calls, QString()); };

    writer.writeLine(u"a", 0, 1, 3);
    EXPECT_EQ(told(), QStringLiteral("[3 a]/!"));
    writer.writeLine(u"b", 1, 2, 2);
    EXPECT_EQ(told(), QStringLiteral("/[2 b]//!"));
    writer.writeLine(u"", 0, 0, 1);
    EXPECT_EQ(told(), QStringLiteral("!")) << "an empty piece is not told";
    writer.write(u"c\r\nd", -7);
    EXPECT_EQ(told(), QStringLiteral("[-7 c\r\nd]")) << "line feeds of a piece belong to it";
    writer.lineFeed(2);
    EXPECT_EQ(told(), QStringLiteral("//"));
    writer.lineFeed(0);
    EXPECT_EQ(told(), QString());
    writer.setHeading({QStringLiteral("h"), 1, 1});
    EXPECT_EQ(told(), QString()) << "setting the heading writes nothing";
    writer.writeHeading();
    EXPECT_EQ(told(), QStringLiteral("/[0 h]/!"));
    writer.setHeaderLine(QStringLiteral("H"));
    writer.writeHeader();
    EXPECT_EQ(told(), QStringLiteral("[0 H  1]/////[0 h]/!"));
    writer.clear();
    EXPECT_EQ(told(), QStringLiteral("!"));
}

TEST(PageWriterHeading, TheObserverIsNotToldWhatCouldNotBeWritten)
{
    const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
    Recorder recorder;
    PageWriter writer(&recorder, LimitedMemory::reallocate);
    ASSERT_TRUE(writer.write(QString(32000, u'x'), 0));
    recorder.calls.clear();
    EXPECT_FALSE(writer.write(u"y", 0));
    writer.lineFeed(3);
    EXPECT_EQ(recorder.calls, QString());
    EXPECT_EQ(memory.largest, LimitedMemory::bytesFor(32000));
}

TEST(PageWriterHeading, WhatTheObserverHasNoMemoryForIsNotWritten)
{
    Recorder recorder;
    PageWriter writer(&recorder);
    writer.writeLine(u"before", 0, 1, 0);
    recorder.hasMemory = false;
    EXPECT_FALSE(writer.write(u"a\nb", 0));
    EXPECT_FALSE(writer.write(QLatin1StringView("a\nb"), 0));
    EXPECT_FALSE(writer.write(QStringView(u"\u6E2C"), 0)) << "also where the text had to become UTF-16";
    EXPECT_FALSE(writer.write(writer.text().view().first(3), 0)) << "a piece of the text itself";
    writer.lineFeed(2);
    EXPECT_EQ(writer.text().view().toString(), QStringLiteral("before\r\n"));
    EXPECT_EQ(writer.lineCount(), 1);
    EXPECT_EQ(writer.lineNumber(), 2);
    EXPECT_TRUE(writer.hasLostText());
    EXPECT_EQ(writer.losses(), 5U) << "of the line feeds, the second is not tried";
    recorder.hasMemory = true;
    EXPECT_TRUE(writer.write(u"after", 0));
    EXPECT_EQ(writer.text().view().toString(), QStringLiteral("before\r\nafter"));
    EXPECT_TRUE(writer.hasLostText()) << "until it is emptied";
    writer.clear();
    EXPECT_FALSE(writer.hasLostText());
}

} // namespace
