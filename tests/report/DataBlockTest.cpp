#include "DataReport.h"
#include "UPointNumber.h"

#include <gtest/gtest.h>

namespace
{

using markup::field;

TEST(DataBlock, WritesLabelSeparatorAndTrimmedValueForEachField)
{
    BlockReport b({field("Note", "Client:  ", "30"), field("Northing", "North", "12.3", "RIGHT"),
                   field("Number", "Point", "8"), field("Chainage", "Station", "12")},
                  "124");
    b.object.Set(6, QStringLiteral("  Harbour Board \t"));
    b.object.Set(2, 12.5);
    b.object.Set(1, UPointNumber(QStringLiteral("12A")));
    b.object.Set(7, -5.5);
    EXPECT_EQ(b.write(0, 0), reportLines(QStringLiteral("Client:  |Harbour Board\n"
                                                        "North|12.500\n"
                                                        "Point|12A\n"
                                                        "Station|-0+005.500\n")));
    EXPECT_EQ(b.report.GetLineNumber(), 5);
    EXPECT_TRUE(b.report.IsModified());
}

TEST(DataBlock, AFieldWithoutAValueIsSkipped)
{
    BlockReport b({field("Note", "Note", "10"), field("Northing", "North", "12.3"), field("Number", "Point", "8")},
                  "124");
    EXPECT_EQ(b.write(0, 0), QString()) << "no value at all";
    b.object.Set(2, 1.0);
    EXPECT_EQ(b.write(0, 0), reportLines(QStringLiteral("North|1.000\n")));
    b.object.Set(6, QString());
    EXPECT_EQ(b.write(0, 0), reportLines(QStringLiteral("Note|\nNorth|1.000\n"))) << "an empty value is a value";
    b.object.Set(99, 1.0);
    EXPECT_EQ(b.write(0, 0), reportLines(QStringLiteral("Note|\nNorth|1.000\n"))) << "a value that no field asks for";
}

TEST(DataBlock, LinesBeforeAndAfterAreAsAskedFor)
{
    struct Row
    {
        int before;
        int after;
        const char16_t *expected;
        int page;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 0, u"Point|1\n", 1, "nothing around"},
        {2, 1, u"\n\nPoint|1\n\n", 1, "blank lines around"},
        {-1, 0, u"\n\n\n\n\n\n\n\n\nPoint|1\n", 2, "below zero before begins a new page"},
        {9, 0, u"\n\n\n\n\n\n\n\n\nPoint|1\n", 2, "more than are left: the blank lines go with the page"},
        {0, -1, u"Point|1\n\n\n\n\n\n\n\n\n", 2, "below zero after ends the page"},
    };
    for (const Row &row : rows) {
        BlockReport b({field("Number", "Point", "8")}, "124", 10);
        b.object.Set(1, UPointNumber(QStringLiteral("1")));
        b.report.WriteLine(QStringLiteral("start"), 0, 1, 0);
        EXPECT_EQ(b.write(row.before, row.after), reportLines(QString::fromUtf16(row.expected))) << row.reason;
        EXPECT_EQ(b.report.GetPageNumber(), row.page) << row.reason;
    }
}

TEST(DataBlock, TheFirstPageBeginsWithItsHeaderAndWithoutTheLinesBefore)
{
    BlockReport b({field("Number", "Point", "8")}, "124");
    b.object.Set(1, UPointNumber(QStringLiteral("1")));
    b.report.SetHeaderFlag(true);
    EXPECT_EQ(b.write(3, 0), reportLines(headerOf(QStringLiteral("Title"), 1) + QStringLiteral("\n\n\n\nPoint|1\n")));
}

TEST(DataBlock, ALaterPageCarriesNoStaleHeading)
{
    BlockReport b({field("Number", "Point", "8")}, "124", 10);
    b.object.Set(1, UPointNumber(QStringLiteral("1")));
    b.report.WriteLine(QStringLiteral("start"), 0, 1, 0);
    b.report.SetHeaderFlag(true);
    b.report.SetHeading(QStringLiteral("Stale"), 3, 3);
    EXPECT_EQ(b.write(0, -1), reportLines(QStringLiteral("Point|1\n") + QString(8, u'\n') +
                                          headerOf(QStringLiteral("Title"), 2) + QStringLiteral("\n\n\n\n\n\n")))
        << "no lines before an empty heading and two after it";
}

TEST(DataBlock, SeparatorsAreWrittenAsTheyAre)
{
    struct Row
    {
        char16_t separator;
        bool raw;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {u' ', false, QStringLiteral("Point 1\n"), "a blank"},
        {u'\t', false, QStringLiteral("Point\t1\n"), "a tab stays in front of the trimmed value"},
        {u'x', true, QStringLiteral(u"Pointÿ1\n"), "raw: the character 255"},
        {u'\u6E2C', false, QStringLiteral(u"Point\u6E2C1\n"), "sixteen bits"},
    };
    for (const Row &row : rows) {
        BlockReport b({field("Number", "Point", "8")}, "124");
        b.object.Set(1, UPointNumber(QStringLiteral("1")));
        b.report.SetDataColumnSeparator(row.separator, row.raw);
        EXPECT_EQ(b.write(0, 0), reportLines(row.expected)) << row.reason;
    }
}

TEST(DataBlock, WithoutTemplateBlockOrObjectNothingIsWritten)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    const UDataObject object;
    EXPECT_FALSE(report.WriteDataBlock(&object, 1, 1)) << "no template";
    EXPECT_FALSE(report.WriteDataBlock(QStringLiteral("Site"), &object, 1, 1)) << "no template";
    EXPECT_EQ(textOf(report), QString());

    BlockReport b({field("Number", "Point", "8")}, "124");
    b.object.Set(1, UPointNumber(QStringLiteral("1")));
    EXPECT_FALSE(b.report.WriteDataBlock(nullptr, 1, 1)) << "no object";
    EXPECT_FALSE(b.report.WriteDataBlock(QStringLiteral("Unknown"), &b.object, 1, 1)) << "no such block";
    EXPECT_EQ(textOf(b.report), QString());
    EXPECT_FALSE(b.report.IsModified());
    EXPECT_TRUE(b.report.WriteDataBlock(QStringLiteral("SITE"), &b.object, 0, 0)) << "a name in any case";
    EXPECT_EQ(textOf(b.report), reportLines(QStringLiteral("Point|1\n")));

    ASSERT_TRUE(b.report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QString()));
    EXPECT_FALSE(b.report.WriteDataBlock(&b.object, 1, 1)) << "the block went with the earlier template";
}

TEST(DataBlock, ABlockWithoutFieldsWritesItsBlankLinesOnly)
{
    BlockReport b({}, "124");
    b.report.WriteLine(QStringLiteral("start"), 0, 1, 0);
    EXPECT_EQ(b.write(1, 2), reportLines(QStringLiteral("\n\n\n")));
}

} // namespace
