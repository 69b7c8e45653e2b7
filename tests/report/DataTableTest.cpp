#include "DataReport.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

using namespace markup;

QByteArray number()
{
    return field("Number", "Pt", "5");
}

QString row(QString text)
{
    return reportLines(std::move(text));
}

TEST(DataTable, WritesHeadingAndALineForEachObject)
{
    TableReport t({number(), field("Northing", "North", "10.3", "RIGHT"), field("Easting", "East", "9.3", "RIGHT")},
                  "124");
    UDataObject &first = t.add("1");
    first.Set(2, 12.5);
    first.Set(3, -7.25);
    UDataObject &second = t.add("12A");
    second.Set(2, 1000.0);
    second.Set(3, 0.0005);
    t.goToLine(2);
    EXPECT_EQ(t.write(1, 1, -1), row(QStringLiteral("\n"
                                                    "Pt   |     North|     East\n"
                                                    "\n"
                                                    "1    |    12.500|   -7.250\n"
                                                    "12A  |  1000.000|    0.001\n"
                                                    "\n")));
    EXPECT_EQ(t.report.GetLineNumber(), 2 + 6);
    EXPECT_TRUE(t.report.IsModified());
}

TEST(DataTable, LinesAroundAndWithinTheHeadingAreAsAskedFor)
{
    struct Row
    {
        int before;
        int after;
        int headingAfter;
        const char16_t *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 0, -1, u"P\n\n1\n", "-1 gives two line ends after the heading"},
        {0, 0, 2, u"P\n\n1\n", "the same in words"},
        {0, 0, 0, u"P1\n", "the heading stays open"},
        {0, 0, 1, u"P\n1\n", "no blank line"},
        {0, 0, 3, u"P\n\n\n1\n", "two blank lines"},
        {0, 0, -2, u"P1\n", "any other number below 0 means no line"},
        {2, 3, 1, u"\n\nP\n1\n\n\n\n", "blank lines around"},
    };
    for (const Row &expected : rows) {
        TableReport t({field("Number", "P", "0")}, "124");
        t.add("1");
        t.goToLine(5);
        EXPECT_EQ(t.write(expected.before, expected.after, expected.headingAfter),
                  row(QString::fromUtf16(expected.expected)))
            << expected.reason;
    }
}

TEST(DataTable, AnEmptyListWritesTheHeadingAndNothingElse)
{
    TableReport t({number()}, "124");
    t.goToLine(3);
    EXPECT_EQ(t.write(0, 0, 1), row(QStringLiteral("Pt   \n")));
    EXPECT_EQ(t.write(1, 2, -1), row(QStringLiteral("\nPt   \n\n\n\n")));
}

TEST(DataTable, RowsEndWithoutATrailingSeparatorButWithTheFillersBlanks)
{
    struct Row
    {
        std::vector<QByteArray> fields;
        const char *separator;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {{number(), field("Note", "", "3")}, "124", QStringLiteral("1    |ab "), "no separator after a normal field"},
        {{number(), field("FILLER", "", "3")}, "124", QStringLiteral("1    |   "), "a filler's blanks end the row"},
        {{number(), field("filler", "", "3"), field("Note", "", "3")},
         "124",
         QStringLiteral("1    |   ab "),
         "no separator after a filler, in any case of its name"},
        {{field("FILLER", "", "2"), number()}, "124", QStringLiteral("  1    "), "a filler in front"},
        {{number(), field("FILLER", "", "3")},
         "32",
         QStringLiteral("1       "),
         "a blank separator cannot be told from the filler's last blank"},
        {{number(), field("FILLER", "", "0")},
         "124",
         QStringLiteral("1    "),
         "an empty filler leaves the separator before it at the end"},
        {{number(), field("Mark", "", "0")}, "124", QStringLiteral("1    | "), "an empty flag is a blank"},
        {{number(), field("Easting", "", "0")}, "124", QStringLiteral("1    |0.000"), "a number without a value is 0"},
        {{number(), field("Count", "", "0")}, "124", QStringLiteral("1    |0"), "a whole number without a value is 0"},
        {{number(), field("Chainage", "", "0")}, "124", QStringLiteral("1    |0+000.000"), "a station without a value"},
        {{number(), field("Done", "", "0")}, "124", QStringLiteral("1    |N"), "a yes or no without a value"},
        {{number(), field("Offset", "", "0.2")}, "124", QStringLiteral("1    |0.00"), "an offset without a value"},
        {{field("Unknown", "", "3"), number()},
         "124",
         QStringLiteral("  0|1    "),
         "a variable that the dictionary lacks is a whole number without a value"},
    };
    for (const Row &expected : rows) {
        TableReport t(expected.fields, expected.separator);
        t.add("1").Set(6, QStringLiteral("ab"));
        t.goToLine(2);
        const QString text = t.write(0, 0, 1);
        EXPECT_TRUE(text.endsWith(row(u'\n' + expected.expected + u'\n')))
            << expected.reason << ": " << testing::PrintToString(text);
    }
}

TEST(DataTable, OnlyOneTrailingSeparatorGoes)
{
    TableReport t({field("Note", "", "0")}, "124");
    t.list.Add().Set(6, QStringLiteral("a||"));
    t.list.Add().Set(6, QString());
    t.list.Add().Set(6, QStringLiteral("|"));
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 0), row(QStringLiteral("a||\n\n|\n"))) << "the row's own separators stay";
}

TEST(DataTable, SuffixMarkersReachTheNextFormattedFieldOnly)
{
    const QByteArray plus = field("SUFFIX_+", "", "");
    const QByteArray right = field("SUFFIX_R", "", "");
    const QByteArray offset = field("Offset", "", "8.2", "RIGHT");
    const QByteArray second = field("Second", "", "8.2", "RIGHT");
    struct Row
    {
        std::vector<QByteArray> fields;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {{offset}, QStringLiteral("   2.50L"), "left of the line"},
        {{plus, offset}, QStringLiteral("   -2.50"), "with its sign"},
        {{right, offset}, QStringLiteral("   2.50L"), "the suffix R shows the side"},
        {{plus, offset, second}, QStringLiteral("   -2.50|   1.25R"), "the field after it has none"},
        {{second, plus, offset}, QStringLiteral("   1.25R|   -2.50"), "before the last field"},
        {{plus, plus, offset}, QStringLiteral("   -2.50"), "twice is once"},
        {{plus, right, offset}, QStringLiteral("   2.50L"), "the last marker counts"},
        {{right, plus, offset}, QStringLiteral("   -2.50"), "the last marker counts"},
        {{plus, field("FILLER", "", "2"), offset}, QStringLiteral("     2.50L"), "a filler takes the suffix"},
        {{field("suffix_+", "", ""), offset}, QStringLiteral("   -2.50"), "in any case"},
        {{offset, plus}, QStringLiteral("   2.50L"), "as the last field a marker has no effect"},
        {{offset, right}, QStringLiteral("   2.50L"), "as the last field a marker has no effect"},
    };
    for (const Row &expected : rows) {
        TableReport t(expected.fields, "124");
        for (int i = 0; i < 2; ++i) {
            UDataObject &object = t.list.Add();
            object.Set(4, -2.5);
            object.Set(5, 1.25);
        }
        t.goToLine(2);
        const QString line = expected.expected + QStringLiteral("\r\n");
        EXPECT_TRUE(t.write(0, 0, 1).endsWith(QStringLiteral("\r\n") + line + line))
            << expected.reason << ": " << testing::PrintToString(textOf(t.report));
    }
}

TEST(DataTable, SeparatorsAreBetweenHeadingColumnsAndBetweenValues)
{
    struct Row
    {
        char16_t separator;
        bool raw;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {u'|', false, QStringLiteral("Pt   |No \n1    |ab \n"), "a character"},
        {u' ', false, QStringLiteral("Pt    No \n1     ab \n"), "a blank"},
        {u'|', true, QStringLiteral(u"Pt   ÿNo \n1    ÿab \n"), "raw: the character 255, whatever is given"},
        {u'\t', false, QStringLiteral("Pt\tNo\n1\tab\n"), "a tab: nothing is filled"},
        {u'\u6E2C', false, QStringLiteral(u"Pt   ,No \n1    \u6E2Cab \n"), "the heading uses the low 8 bits"},
    };
    for (const Row &expected : rows) {
        TableReport t({number(), field("Note", "No", "3")}, "59");
        t.add("1").Set(6, QStringLiteral("ab"));
        t.report.SetDataColumnSeparator(expected.separator, expected.raw);
        ASSERT_TRUE(t.report.LoadTemplateTable(QStringLiteral("Points")));
        t.goToLine(2);
        EXPECT_EQ(t.write(0, 0, 1), row(expected.expected)) << expected.reason;
    }
}

TEST(DataTable, SortsTheListByTheTablesKeys)
{
    TableReport t({number(), field("Note", "Note", "4")}, "124", 72, {"Note", "Number"});
    struct Point
    {
        const char *number;
        const char16_t *note;
    };
    constexpr Point points[] = {{"10", u"b"}, {"9", u"b"}, {"1", u"c"}, {"12A", u"a"}, {"12", u"a"}};
    for (const Point &point : points) {
        t.add(point.number).Set(6, QString::fromUtf16(point.note));
    }
    t.add("7"); // without a note
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), row(QStringLiteral("Pt   |Note\n"
                                                   "7    |    \n"
                                                   "12   |a   \n"
                                                   "12A  |a   \n"
                                                   "9    |b   \n"
                                                   "10   |b   \n"
                                                   "1    |c   \n")));
}

TEST(DataTable, WithoutKeysTheListKeepsItsOrder)
{
    TableReport t({number()}, "124");
    for (const char *point : {"3", "1", "2"}) {
        t.add(point);
    }
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), row(QStringLiteral("Pt   \n3    \n1    \n2    \n")));
}

/// A list that makes one object at a time, as a host with more data than memory has it.
class OneAtATime : public UDataObjectList
{
public:
    UDataObject *GetAt(std::size_t index) override
    {
        if (index >= 3) {
            return nullptr;
        }
        object_.Clear();
        object_.Set(1, UPointNumber(QString::number(index)));
        return &object_;
    }

private:
    UDataObject object_;
};

TEST(DataTable, AListMayHoldOneObjectAtATime)
{
    TableReport t({number()}, "124");
    t.goToLine(2);
    const qsizetype size = t.report.GetText().size();
    OneAtATime list;
    EXPECT_TRUE(t.report.WriteDataTable(&list, 0, 0, 1));
    EXPECT_EQ(t.report.GetText().sliced(size).toString(), row(QStringLiteral("Pt   \n0    \n1    \n2    \n")));
}

TEST(DataTable, WithoutTemplateTableOrListNothingIsWritten)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    UDataObjectList list;
    EXPECT_FALSE(report.WriteDataTable(&list, 1, 1, 1)) << "no template";
    EXPECT_FALSE(report.WriteDataTable(QStringLiteral("Points"), &list, 1, 1, 1)) << "no template";
    EXPECT_EQ(textOf(report), QString());

    TableReport t({number()}, "124");
    EXPECT_FALSE(t.report.WriteDataTable(nullptr, 1, 1, 1)) << "no list";
    EXPECT_FALSE(t.report.WriteDataTable(QStringLiteral("Unknown"), &t.list, 1, 1, 1)) << "no such table";
    EXPECT_EQ(textOf(t.report), QString());
    EXPECT_FALSE(t.report.IsModified());
    EXPECT_TRUE(t.report.WriteDataTable(QStringLiteral("POINTS"), &t.list, 0, 0, 1)) << "a name in any case";

    ASSERT_TRUE(t.report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QString()));
    t.report.SetModifiedFlag(false);
    EXPECT_FALSE(t.report.WriteDataTable(&t.list, 1, 1, 1)) << "the table went with the earlier template";
    EXPECT_FALSE(t.report.IsModified());
}

} // namespace
