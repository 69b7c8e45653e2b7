#include "DataReport.h"

#include <gtest/gtest.h>

namespace
{

using markup::field;

const std::vector<QByteArray> pointColumn = {field("Number", "Point", "5")};

/// The header of page `page`, the table's title in it, with its gap.
QString header(int page)
{
    return headerOf(QStringLiteral("Title"), page) + QStringLiteral("\n\n\n\n");
}

TEST(DataTablePage, AHeadingWithThreeLinesLeftBeginsTheNextPage)
{
    struct Row
    {
        int line;
        bool header;
        QString expected;
        int page;
        const char *reason;
    };
    const QString gap = QStringLiteral("\n\n\n\n");
    const Row rows[] = {
        {68, false, QStringLiteral("Point\n1    \n"), 1, "four lines left: heading and row"},
        {69, false, gap + QStringLiteral("1    \n"), 2,
         "three lines left: without headers the heading at the page's start is not written"},
        {70, false, QStringLiteral("\n\n\n1    \n"), 2, "two lines left"},
        {72, false, QStringLiteral("\nPoint\n1    \n"), 2,
         "a full page is turned before the table looks for its place"},
        {68, true, QStringLiteral("Point\n1    \n"), 1, "four lines left: heading and row"},
        {69, true, gap + header(2) + QStringLiteral("Point\n1    \n"), 2, "three lines left: the header brings it"},
    };
    for (const Row &row : rows) {
        TableReport t(pointColumn, "124");
        t.add("1");
        t.goToLine(row.line);
        t.report.SetHeaderFlag(row.header);
        EXPECT_EQ(t.write(0, 0, 1), reportLines(row.expected)) << row.reason;
        EXPECT_EQ(t.report.GetPageNumber(), row.page) << row.reason;
    }
}

TEST(DataTablePage, AnEmptyReportWithoutHeadersGetsNoHeading)
{
    TableReport t(pointColumn, "124");
    t.add("1");
    t.report.WriteTableName(true);
    EXPECT_EQ(t.write(3, 0, -1), reportLines(QStringLiteral("1    \n")));
    EXPECT_EQ(t.report.GetPageNumber(), 1);
    EXPECT_EQ(t.report.GetLineNumber(), 2);
}

TEST(DataTablePage, AnEmptyReportWithHeadersGetsHeaderAndHeading)
{
    TableReport t(pointColumn, "124");
    t.add("1");
    t.report.SetHeaderFlag(true);
    EXPECT_EQ(t.write(3, 0, -1), reportLines(header(1) + QStringLiteral("Point\n\n1    \n")));
    EXPECT_EQ(t.report.GetPageNumber(), 1);
}

TEST(DataTablePage, TheTablesNameIsAboveItsHeadingInTheMiddleOfAPage)
{
    TableReport t(pointColumn, "124");
    t.add("1");
    t.report.WriteTableName(true);
    t.goToLine(10);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("\nPoints\n\nPoint\n1    \n")));
    t.goToLine(55); // 54 lines on, three left
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("\n\n\n\n1    \n"))) << "not at a page's start";
    t.report.WriteTableName(false);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Point\n1    \n")));
}

TEST(DataTablePage, TheHeadingRepeatsOnEveryPage)
{
    TableReport t(pointColumn, "124", 12);
    for (const char *number : {"1", "2", "3", "4", "5", "6", "7"}) {
        t.add(number);
    }
    t.report.SetHeaderFlag(true);
    EXPECT_EQ(t.write(0, 0, 1),
              reportLines(header(1) + QStringLiteral("Point\n1    \n2    \n3    \n4    \n5    \n6    \n\n") +
                          header(2) + QStringLiteral("Point\n7    \n")));
    EXPECT_EQ(t.report.GetLineNumber(), 7);
}

TEST(DataTablePage, APageThatTheLastRowTurnsHasNoHeading)
{
    TableReport t(pointColumn, "124", 12);
    for (const char *number : {"1", "2", "3", "4", "5", "6"}) {
        t.add(number);
    }
    t.report.SetHeaderFlag(true);
    EXPECT_EQ(t.write(0, 0, 1),
              reportLines(header(1) + QStringLiteral("Point\n1    \n2    \n3    \n4    \n5    \n6    \n\n") +
                          header(2) + QStringLiteral("\n\n")))
        << "two lines follow the cleared heading";
    EXPECT_EQ(t.report.GetPageNumber(), 2);
    EXPECT_EQ(t.report.GetLineNumber(), 7);
}

TEST(DataTablePage, TheLastRowOnAFullPageBeginsTheNextOneWithItsHeading)
{
    TableReport t(pointColumn, "124", 12);
    t.add("1");
    t.report.SetHeaderFlag(true);
    t.goToLine(1);
    t.report.NewPage(-1);
    const qsizetype size = t.report.GetText().size();
    t.report.LineFeed(3); // line 8 of 12, four left
    EXPECT_TRUE(t.report.WriteDataTable(&t.list, 0, 0, 4));
    EXPECT_EQ(t.report.GetText().sliced(size).toString(),
              reportLines(QStringLiteral("\n\n\nPoint\n\n\n\n\n") + header(3) + QStringLiteral("Point\n\n\n\n1    \n")))
        << "the heading's line ends filled the page, and it is written again above the row";
}

TEST(DataTablePage, TheHeadingDoesNotOutliveItsTable)
{
    TableReport t(pointColumn, "124");
    t.add("1");
    t.report.SetHeaderFlag(true);
    t.report.SetHeading(QStringLiteral("Earlier"), 5, 5);
    t.write(0, 0, 1);
    const qsizetype size = t.report.GetText().size();
    t.report.NewPage(-1);
    EXPECT_TRUE(t.report.GetText().sliced(size).toString().endsWith(reportLines(header(2) + QStringLiteral("\n\n"))))
        << "no heading, no lines before it and two after it";
}

TEST(DataTablePage, LinesBeforeBelowZeroBeginANewPage)
{
    TableReport t(pointColumn, "124", 20);
    t.add("1");
    t.goToLine(10);
    EXPECT_EQ(t.write(-1, 0, 1), reportLines(QString(11, u'\n') + QStringLiteral("Point\n1    \n")));
    EXPECT_EQ(t.report.GetPageNumber(), 2);
    EXPECT_EQ(t.write(0, -1, 1), reportLines(QStringLiteral("Point\n1    \n") + QString(16, u'\n')))
        << "below zero after the table ends the page";
    EXPECT_EQ(t.report.GetPageNumber(), 3);
}

TEST(DataTablePage, ATableWithoutLabelsHasNoHeading)
{
    TableReport t({field("Count", "", "0")}, "124");
    t.list.Add().Set(8, qint32(-5));
    t.report.WriteTableName(true);
    t.goToLine(70);
    EXPECT_EQ(t.write(0, 0, -1), reportLines(QStringLiteral("-5\n")))
        << "an empty heading needs no place, and no name is above it";
}

} // namespace
