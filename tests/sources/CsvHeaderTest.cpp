#include "CsvObjectList.h"

#include "SurveyRows.h"

#include <gtest/gtest.h>

// What a first row is that may be a header row or data.

namespace
{

using kareport::ColumnChoice;
using kareport::CsvDialect;
using kareport::CsvObjectList;

struct Read
{
    QStringList rows;
    QStringList notes; ///< each with its place
};

Read read(const QByteArray &text, const CsvDialect &dialect)
{
    CsvObjectList list(kareport::FileBytes::holding(QStringLiteral("points.csv"), text), dialect, survey::variables(),
                       {});
    Read result;
    result.rows = survey::rowsOf(list);
    for (const kareport::InputError &note : list.differences()) {
        result.notes.append(placeText(note) + u' ' + note.text);
    }
    return result;
}

CsvDialect ordered(bool isHeaderSaid = false)
{
    CsvDialect dialect;
    dialect.order = QStringLiteral("PNEZD");
    dialect.isHeaderSaid = isHeaderSaid;
    return dialect;
}

CsvDialect chosen(std::vector<ColumnChoice> columns, bool isHeaderSaid = false)
{
    CsvDialect dialect;
    dialect.columns = std::move(columns);
    dialect.isHeaderSaid = isHeaderSaid;
    return dialect;
}

TEST(CsvHeader, OfNumbersIsOneWhereTheJobReadsItSo)
{
    const Read byName = read("2019,2020\n1,2\n", chosen({{QStringLiteral("Elevation"), 2020}}));
    EXPECT_EQ(byName.rows, QStringList(QStringLiteral("elevation=2"))) << "a number beyond the columns is a name";
    EXPECT_EQ(byName.notes, QStringList());
    const std::vector<ColumnChoice> numbers = {{QStringLiteral("Number"), 1}, {QStringLiteral("Elevation"), 2}};
    const Read unsure = read("Pt,2020\n1,2\n", chosen(numbers));
    EXPECT_TRUE(unsure.rows.value(0).startsWith(u"error 1:1 the header row holds values")) << "it may be a point";
    EXPECT_TRUE(unsure.rows.value(0).endsWith(u"otherwise set \"header\" to true")) << "what helps is said";
    const Read said = read("Pt,2020\n1,2\n", chosen(numbers, true));
    EXPECT_EQ(said.rows, QStringList(QStringLiteral("number=1 elevation=2")));
    EXPECT_EQ(said.notes, QStringList());
}

TEST(CsvHeader, ThatHasSomeValuesIsNoted)
{
    struct Row
    {
        const char *header;
        const char *expected; ///< the place of the note and its number of values; nothing for no note
        const char *reason;
    };
    constexpr Row rows[] = {
        {"1,x,y,4,elm", "1:7 the header row holds 1 value", "a point with more wrong cells than right ones"},
        {"Pt,North,East,2020,Code", "1:15 the header row holds 1 value", "or a name that looks like a number"},
        {"Pt,North,East,Elev,1", nullptr, "a text that is a number may be a name"},
        {"Pt,N,E,Z,D", nullptr, "names"},
    };
    for (const Row &row : rows) {
        const QByteArray text = QByteArray(row.header) + "\n2,3,4,5,oak\n";
        const Read result = read(text, ordered());
        EXPECT_EQ(result.rows.size(), 1) << row.reason;
        ASSERT_EQ(result.notes.size(), row.expected != nullptr ? 1 : 0) << row.reason;
        EXPECT_TRUE(row.expected == nullptr || result.notes[0].startsWith(QString::fromUtf8(row.expected)))
            << row.reason << ": " << result.notes.value(0).toStdString();
        EXPECT_EQ(read(text, ordered(true)).notes, QStringList()) << row.reason << ", as the job says";
    }
    const std::vector<ColumnChoice> columns = {{QStringLiteral("Northing"), 1},
                                               {QStringLiteral("Easting"), 2},
                                               {QStringLiteral("Elevation"), 3},
                                               {QStringLiteral("Count"), 4},
                                               {QStringLiteral("Station"), 5}};
    const Read two = read("x,1,2,y,z\n1,2,3,4,5\n", chosen(columns));
    ASSERT_EQ(two.notes.size(), 1);
    EXPECT_TRUE(two.notes[0].startsWith(u"1:3 the header row holds 2 values")) << two.notes[0].toStdString();
}

TEST(CsvHeader, LinesThatArePassedOverMayEndWithSeveralCarriageReturns)
{
    CsvDialect dialect;
    dialect.comment = '#';
    dialect.passesBlankLines = true;
    dialect.skip = 1;
    const QStringList point(QStringLiteral("number=1"));
    EXPECT_EQ(read("made today\r\r\nNumber\n# one\r\r\n\r\r\n1\n# two\r\r\r\n", dialect).rows, point);
    const Read alone = read("made today\nNumber\n1\n# one\r# two\r\n", dialect);
    EXPECT_TRUE(alone.rows.value(1).startsWith(u"error 4:6 a carriage return")) << alone.rows.join(u'|').toStdString();
    const Read atEnd = read("made today\nNumber\n1\n# one\r\r", dialect);
    EXPECT_TRUE(atEnd.rows.value(1).startsWith(u"error 4:6 a carriage return")) << "there is no line feed";
}

} // namespace
