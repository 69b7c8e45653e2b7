#include "DataReport.h"

#include <gtest/gtest.h>

namespace
{

using markup::field;

const std::vector<QByteArray> pointColumn = {field("Number", "Point", "5")};

QString header(int page)
{
    return headerOf(QStringLiteral("Title"), page) + QStringLiteral("\n\n\n\n");
}

TEST(DataWriterForms, TheNameIsBelowTheHeaderOfAFreshReport)
{
    TableReport t(pointColumn, "124");
    t.add("1");
    t.report.SetHeaderFlag(true);
    t.report.WriteTableName(true);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(header(1) + QStringLiteral("\nPoints\n\nPoint\n1    \n")));
    EXPECT_EQ(t.report.GetLineNumber(), 10);
}

TEST(DataWriterForms, WithFourLinesLeftTheNameAndTheHeadingFillThePage)
{
    for (const bool withHeader : {false, true}) {
        TableReport t(pointColumn, "124");
        t.add("1");
        t.goToLine(68);
        t.report.WriteTableName(true);
        t.report.SetHeaderFlag(withHeader);
        EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("\nPoints\n\nPoint\n\n") +
                                                (withHeader ? header(2) + QStringLiteral("Point\n") : QString()) +
                                                QStringLiteral("1    \n")))
            << withHeader << ": the row begins the next page";
        EXPECT_EQ(t.report.GetPageNumber(), 2) << withHeader;
    }
}

TEST(DataWriterForms, WithoutHeadersTheSecondPageHasNoHeading)
{
    TableReport t(pointColumn, "124", 12);
    QString rows;
    for (const char *number : {"1", "2", "3", "4", "5", "6", "7", "8", "9", "10"}) {
        t.add(number);
        rows += (number == QByteArray("10") ? QStringLiteral("\n") : QString()) +
                QString::fromUtf8(number).leftJustified(5) + u'\n';
    }
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Point\n") + rows)) << "nine rows, then the page turns";
    EXPECT_EQ(t.report.GetPageNumber(), 2);
    EXPECT_EQ(t.report.GetLineNumber(), 2);
}

TEST(DataWriterForms, ANamedTableTakesTheLoadedOnesPlaceAndStays)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    folders.putIntoLibrary(
        markup::surveyTemplate(markup::output("Table", "A", "Survey", {field("Number", "PtA", "5")}) +
                                   markup::output("Table", "B", "Survey", {field("Number", "PtB", "5")}),
                               QByteArray(), markup::separatorOption("124")));
    UReportDoc report;
    report.FixPage(72, 80);
    ASSERT_TRUE(report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QStringLiteral("A"), QString()));
    report.WriteLine(QStringLiteral("start"), 0, 1, 0);
    UDataObjectList list;
    EXPECT_TRUE(report.WriteDataTable(&list, 0, 0, 1));
    EXPECT_TRUE(report.WriteDataTable(QStringLiteral("b"), &list, 0, 0, 1));
    EXPECT_TRUE(report.WriteDataTable(&list, 0, 0, 1));
    EXPECT_TRUE(report.WriteDataTable(QStringLiteral("A"), &list, 0, 0, 1));
    EXPECT_EQ(textOf(report), reportLines(QStringLiteral("start\nPtA  \nPtB  \nPtB  \nPtA  \n")));
}

TEST(DataWriterForms, ANamedBlockTakesTheLoadedOnesPlaceAndStays)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    folders.putIntoLibrary(
        markup::surveyTemplate(QByteArray(),
                               markup::output("Block", "A", "Survey", {field("Number", "PtA", "5")}) +
                                   markup::output("Block", "B", "Survey", {field("Number", "PtB", "5")}),
                               markup::separatorOption("124")));
    UReportDoc report;
    report.FixPage(72, 80);
    ASSERT_TRUE(report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QStringLiteral("A")));
    UDataObject object;
    object.Set(1, UPointNumber(QStringLiteral("7")));
    EXPECT_TRUE(report.WriteDataBlock(&object, 0, 0));
    EXPECT_TRUE(report.WriteDataBlock(QStringLiteral("b"), &object, 0, 0));
    EXPECT_TRUE(report.WriteDataBlock(&object, 0, 0));
    EXPECT_EQ(textOf(report), reportLines(QStringLiteral("PtA|7\nPtB|7\nPtB|7\n")));
}

TEST(DataWriterForms, MarkersAndUnknownVariablesHaveNoLineInABlock)
{
    BlockReport b({field("FILLER", "f", "5"), field("SUFFIX_R", "r", "5"), field("SUFFIX_+", "p", "5"),
                   field("Nothing", "n", "5"), field("Number", "Point", "8")},
                  "124");
    b.object.Set(1, UPointNumber(QStringLiteral("1")));
    EXPECT_EQ(b.write(0, 0), reportLines(QStringLiteral("Point|1\n")));
}

TEST(DataWriterForms, LineEndsOfAValueCountInTheLineNumber)
{
    BlockReport b({field("Note", "Note", "10")}, "124");
    b.object.Set(6, QStringLiteral("a\r\nb"));
    EXPECT_EQ(b.write(0, 0), QStringLiteral("Note|a\r\nb\r\n"));
    EXPECT_EQ(b.report.GetLineNumber(), 3);
    EXPECT_EQ(b.report.GetLineCount(), 2);

    TableReport t({field("Note", "N", "1")}, "124");
    t.list.Add().Set(6, QStringLiteral("a\r\nb"));
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), QStringLiteral("N\r\na\r\nb\r\n"));
    EXPECT_EQ(t.report.GetLineNumber(), 5);
}

} // namespace
