#include "SurveyRows.h"

#include <gtest/gtest.h>

namespace
{

using kareport::ColumnChoice;
using kareport::CsvDialect;
using kareport::DelimiterKind;
using kareport::TextEncoding;

struct Row
{
    CsvDialect dialect;
    QByteArray text;
    QStringList expected; ///< one text a row; an error begins with "error", its place and the beginning of its text
    const char *reason;
};

void check(const std::vector<Row> &rows)
{
    for (const Row &row : rows) {
        const QStringList read = survey::rowsOf(row.text, row.dialect);
        ASSERT_EQ(read.size(), row.expected.size()) << row.reason << ": " << read.join(u'\n').toStdString();
        for (qsizetype i = 0; i < read.size(); ++i) {
            const bool isError = row.expected[i].startsWith(u"error");
            EXPECT_TRUE(isError ? read[i].contains(row.expected[i].mid(6)) : read[i] == row.expected[i])
                << row.reason << ": " << read[i].toStdString() << " instead of " << row.expected[i].toStdString();
        }
    }
}

CsvDialect spaced()
{
    CsvDialect dialect;
    dialect.kind = DelimiterKind::Whitespace;
    return dialect;
}

CsvDialect ordered(const char *order, std::vector<ColumnChoice> columns = {})
{
    CsvDialect dialect;
    dialect.hasHeader = false;
    dialect.order = QString::fromUtf8(order);
    dialect.columns = std::move(columns);
    return dialect;
}

CsvDialect chosen(std::vector<ColumnChoice> columns, bool hasHeader = true)
{
    CsvDialect dialect;
    dialect.hasHeader = hasHeader;
    dialect.columns = std::move(columns);
    return dialect;
}

CsvDialect numbered(char delimiter, char decimal, const char *thousands)
{
    CsvDialect dialect;
    dialect.delimiter = delimiter;
    dialect.numbers = {decimal, thousands};
    return dialect;
}

CsvDialect passing(qsizetype skip, std::optional<char> comment, bool passesBlankLines)
{
    CsvDialect dialect;
    dialect.skip = skip;
    dialect.comment = comment;
    dialect.passesBlankLines = passesBlankLines;
    return dialect;
}

TEST(CsvDialect, BlanksAndTabsDelimit)
{
    check({
        {spaced(), "Number Northing\n1 2.5\n", {"number=1 northing=2.5"}, "one blank"},
        {spaced(), "  Number \t Northing  \r\n\t1   2.5 \r\n", {"number=1 northing=2.5"}, "as many as there are"},
        {spaced(), "Number Northing\n1 2.5", {"number=1 northing=2.5"}, "the last row without a line end"},
        {spaced(),
         "Number Description\n1 \"a b\"\n2 \"say \"\"x\"\"\"\n",
         {"number=1 description=a b", "number=2 description=say \"x\""},
         "quotes hold blanks"},
        {spaced(), "Number Northing\n1 \"\"\n", {"number=1"}, "an empty cell is in quotes"},
        {spaced(), "Number Northing\n1 2\n \t\n\n", {"number=1 northing=2"}, "blank lines at the end are not rows"},
        {spaced(), "Number Northing\n1 2 3\n", {"error 2:5 the row has 3 cells: 2 were expected"}, "a cell too many"},
        {spaced(), "Number Northing\n1\n", {"error 2:1 the row has 1 cells"}, "a cell too few"},
        {spaced(), "Number Northing\n  \n1 2\n", {"error 2:1 the row has 0 cells"}, "a blank line inside"},
        {spaced(),
         "Number Northing\n1 x\n",
         {"error 2:3 the cell \"x\" of the column \"Northing\" does not fit"},
         "a cell that does not fit"},
        {spaced(), "Number Northing\n1 2\"\n", {"error 2:4 a quote inside a cell"}, "a quote in a plain cell"},
        {spaced(), "Number Northing\n1 \"2\"3\n", {"error 2:6 a delimiter was expected"}, "a cell after a quote"},
        {spaced(),
         "Number Northing\n1 \"2\n",
         {"error 2:3 the quoted cell has no closing quote"},
         "a quote that is not closed"},
        {spaced(),
         QByteArray("Number Northing\n1 2\0\n", 21),
         {"error 2:4 the file contains a zero byte"},
         "a zero byte"},
        {spaced(), "Number Northing\n1 \xFF\n", {"error 2:3 the file is not UTF-8"}, "a byte that is not a character"},
        {spaced(),
         "Number Northing\n1 " + QByteArray(1 << 20, '2') + "\n",
         {"error 2:1 the row is longer than"},
         "a row that is not one"},
        {spaced(),
         "Number,Northing\n1,2\n",
         {"error 1:1 no column of the header row is a variable"},
         "commas do not delimit"},
    });
}

TEST(CsvDialect, AnOrderNamesTheColumns)
{
    check({
        {ordered("PNEZD"),
         "1,2,3,4,TREE\n2,3,4,5,\"OAK, OLD\"\n",
         {"number=1 northing=2 easting=3 elevation=4 description=TREE",
          "number=2 northing=3 easting=4 elevation=5 description=OAK, OLD"},
         "in full"},
        {ordered("penzd"),
         "1,2,3,4,T\n",
         {"number=1 northing=3 easting=2 elevation=4 description=T"},
         "easting first, in small letters"},
        {ordered("P--Z-"), "1,2,3,4,T\n", {"number=1 elevation=4"}, "a hyphen passes one over"},
        {ordered("NE"), "1,2\n", {"northing=1 easting=2"}, "two of them"},
        {ordered("PNEZD"),
         "1,2,3,4\n",
         {"error 1:7 the row has 4 cells: 5 were expected, as in all rows"},
         "a cell too few"},
        {ordered("PNEZD"), "1,2,3,4,5,6\n", {"error 1:11 the row has 6 cells: 5 were expected"}, "a cell too many"},
        {ordered("PNEZD"),
         "Number,N,E,Z,D\n",
         {"error 1:8 the cell \"N\" of the column \"Northing\""},
         "a header row that was not announced"},
        {ordered("PNEZD"), "", {}, "no row"},
        {ordered("P-"), "1,2\n", {"number=1"}, "one of two"},
        {ordered("PP"), "1,2\n", {"error \"PP\" is not an order of columns"}, "a letter twice"},
        {ordered("PNX"), "1,2,3\n", {"error \"PNX\" is not an order of columns"}, "another letter"},
        {ordered("---"), "1,2,3\n", {"error no column is a variable"}, "nothing is read"},
        {ordered("P-", {{"Count", 2}}), "1,2\n", {"number=1 count=2"}, "a column of the rest is chosen"},
        {ordered("PZ", {{"Station", 2}}), "1,2\n", {"number=1 station=2"}, "a column is chosen for another variable"},
        {ordered("PZ", {{"Station", QStringLiteral("elevation")}}),
         "1,2\n",
         {"number=1 station=2"},
         "by the name that it has"},
        {ordered("PZ", {{"Station", 3}}),
         "1,2\n",
         {"error there is no column 3: one of 1 to 2 was expected"},
         "a column that does not exist"},
    });
}

TEST(CsvDialect, AHeaderRowBesideAnOrderIsSkippedUnlessItMayBeData)
{
    CsvDialect withHeader = ordered("PN");
    withHeader.hasHeader = true;
    check({{withHeader, "Northing,Number\n1,2\n", {"number=1 northing=2"}, "a header row is skipped"},
           {withHeader, "", {"error 1:1 a header row was expected"}, "a header row is missing"},
           {withHeader,
            "1,2\n2,3\n",
            {"error 1:1 the header row holds values that fit the columns"},
            "the first point would be lost"},
           {withHeader, ",2\n2,3\n", {"error 1:1 the header row holds values"}, "also where it lacks a text"},
           {withHeader, "1,\n2,3\n", {"number=2 northing=3"}, "a row without a number may be one of names"},
           {withHeader, "1,2,x\n2,3\n", {"error 1:1 the header row holds values"}, "with a cell too many"}});
    CsvDialect points = ordered("PNEZD");
    points.hasHeader = true;
    const char *lost = "error 1:1 the header row holds values";
    const char *point = "number=2 northing=3 easting=4 elevation=5 description=oak";
    check({{points, "1,2,3,4\n2,3,4,5,oak\n", {lost}, "a first point without its last cell"},
           {points, "1,2,3,4,elm,x\n2,3,4,5,oak\n", {lost}, "with one more"},
           {points, "1,2,x,4,elm\n2,3,4,5,oak\n", {lost}, "with one that is wrong"},
           {points, "1,2\n2,3,4,5,oak\n", {lost}, "with two cells"},
           {points, "1\n2,3,4,5,oak\n", {point}, "a text alone is not a point"},
           {points, "Pt,North,East,2020,Code\n2,3,4,5,oak\n", {point}, "a name may be a number"},
           {points, "Made today\n2,3,4,5,oak\n", {point}, "a title"},
           {points, "Pt,N,E,Z\n2,3,4,5,oak\n", {point}, "names, too few of them"}});
    CsvDialect texts = ordered("PD");
    texts.hasHeader = true;
    CsvDialect list;
    list.names.append(QStringLiteral("Number"));
    list.names.append(QStringLiteral("Northing"));
    CsvDialect found = withHeader;
    found.kind = DelimiterKind::Automatic;
    check({{texts, "1,a\n2,b\n", {"number=2 description=b"}, "texts may be names"},
           {list, "1,2\n2,3\n", {"error 1:1 the header row holds values"}, "a list of names"},
           {list, "Pt,North\n2,3\n", {"number=2 northing=3"}, "a list of names and a header row"},
           {found, "1;2\n2;3\n", {"error 1:1 the header row holds values"}, "with a delimiter that is detected"},
           {chosen({{"Number", 1}, {"Northing", 2}}),
            "1,2\n2,3\n",
            {"error 1:1 the header row holds values"},
            "numbers of columns"},
           {chosen({{"Elevation", 2}}), "Number,2020\n1,2\n", {"number=1 elevation=2"}, "a name is read as one"}});
}

TEST(CsvDialect, ColumnsAreChosen)
{
    const QStringList point = {"number=1 elevation=3"};
    check({
        {chosen({{"Elevation", QStringLiteral("Z")}}), "Number,Y,Z\n1,2,3\n", point, "by its name"},
        {chosen({{"elevation", QStringLiteral("z")}}), "Number,Y,Z\n1,2,3\n", point, "in any case"},
        {chosen({{"Elevation", 3}}), "Number,Y,Z\n1,2,3\n", point, "by its number"},
        {chosen({{"Elevation", 2020}}), "Number,2019,2020\n1,2,3\n", point, "a year is the name of a column"},
        {chosen({{"Elevation", 2021}}),
         "Number,2019,2020\n1,2,3\n",
         {"error there is no column 2021: one of 1 to 3 was expected"},
         "a year that is none"},
        {chosen({{"Elevation", QStringLiteral("Z")}}), "Number,Elevation,Z\n1,2,3\n", point,
         "the choice wins over the name"},
        {chosen({{"Elevation", QStringLiteral("Northing")}}), "Number,Y,Northing\n1,2,3\n", point,
         "a column that is chosen is not read by its name"},
        {chosen({{"Elevation", 3}, {"Northing", 3}}),
         "Number,Y,Z\n1,2,3\n",
         {"number=1 northing=3 elevation=3"},
         "one column for two variables"},
        {chosen({{"Number", 1}, {"Elevation", 3}}, false), "1,2,3\n", point, "without a header row"},
        {chosen({{"Number", 1}, {"Elevation", 3}}, false),
         "1,2\n",
         {"error there is no column 3: one of 1 to 2 was expected"},
         "a number beyond the first row"},
        {chosen({{"Number", 1}, {"Elevation", 3}}, false),
         "1,2,3\n4,5\n",
         {point[0], "error 2:3 the row has 2 cells: 3 were expected"},
         "a shorter row"},
        {chosen({{"Number", 1}, {"Elevation", 3}}, false),
         "1,2,x\n",
         {"error 1:5 the cell \"x\" of the column \"Elevation\""},
         "it is called by its variable"},
        {chosen({{"Number", 1}, {"Elevation", 3}}, false), "", {}, "a file without a row"},
        {chosen({{"Number", QStringLiteral("P")}}, false),
         "1,2,3\n",
         {"error there is no column \"P\""},
         "a name where there are none"},
        {chosen({}, false), "1,2,3\n", {"error no column is a variable"}, "nothing says what the columns are"},
    });
}

TEST(CsvDialect, ColumnsThatCannotBeChosenAreSaid)
{
    const QStringList point = {"number=1 elevation=3"};
    check({
        {chosen({{"Elevation", 0}}), "Number,Y,Z\n1,2,3\n", {"error 1:1 there is no column 0"}, "numbers begin with 1"},
        {chosen({{"Elevation", QStringLiteral("Elv")}}),
         "Number,Elev\n1,2\n",
         {"error 1:1 there is no column \"Elv\": did you mean \"Elev\"?"},
         "a name that is misspelt"},
        {chosen({{"Elevation", QStringLiteral("Q")}}),
         "Number,Elev\n1,2\n",
         {"error 1:1 there is no column \"Q\": one of Number, Elev was expected"},
         "another name"},
        {chosen({{"Elev", QStringLiteral("Z")}}),
         "Number,Z\n1,2\n",
         {"error 1:1 the dictionary has no variable \"Elev\": did you mean \"Elevation\"?"},
         "no variable"},
        {chosen({{"Elevation", 1}, {"ELEVATION", 2}}),
         "Number,Z\n1,2\n",
         {"error 1:1 the variable \"ELEVATION\" has two columns"},
         "a variable that is chosen twice"},
        {chosen({{"Elevation", QStringLiteral("Z")}}),
         "Number,Z,z\n1,2,3\n",
         {"error 1:10 the columns 2 and 3 are both named \"Z\""},
         "two columns of the name"},
        {chosen({{"Elevation", 3}}), "Number,Z,Z\n1,2,3\n", point, "a number says which of the two"},
    });
}

TEST(CsvDialect, NumbersHaveTheirMarks)
{
    check({
        {numbered(';', ',', ""), "Number;Northing\n1;2,5\n", {"number=1 northing=2.5"}, "a decimal comma"},
        {numbered(';', ',', ""),
         "Number;Northing\n1,5;-,5e3\n",
         {"number=1,5 northing=-500"},
         "texts stay as they are"},
        {numbered(';', ',', ""), "Northing\n2.5\n", {"error 2:1 the cell \"2.5\""}, "a point is not a decimal comma"},
        {numbered(';', ',', ""), "Northing\n2,5,5\n", {"error 2:1 the cell \"2,5,5\""}, "two commas"},
        {numbered(';', ',', ""), "Northing\nINF\n\n", {"northing=inf"}, "infinite"},
        {numbered(';', ',', "."),
         "Northing;Count\n1.234.567,25;1.000\n",
         {"northing=1234567.25 count=1000"},
         "points between thousands"},
        {numbered(';', ',', "."), "Northing\n1234567,25\n", {"northing=1234567.25"}, "thousands are not needed"},
        {numbered(';', ',', "."), "Northing\n1.23\n", {"error 2:1 the cell \"1.23\""}, "no group of three"},
        {numbered(';', ',', "."),
         "Northing\n0.123\n",
         {"error 2:1 the cell \"0.123\""},
         "a decimal point is not thousands"},
        {numbered(';', '.', ","), "Northing\n-0,123\n", {"error 2:1 the cell"}, "nor is a decimal comma"},
        {numbered(';', '.', ","),
         "Northing\n0,123.5\n0,123,456\n",
         {"northing=123.5", "northing=123456"},
         "more of it is"},
        {numbered(';', '.', "'"), "Northing\n0'123.5\n", {"northing=123.5"}, "an apostrophe is not a decimal sign"},
        {numbered(';', ',', "."), "Northing\n0,5\n10.123,5\n", {"northing=0.5", "northing=10123.5"}, "zeros elsewhere"},
        {numbered(';', ',', "."), "Northing\n1.2345\n", {"error 2:1 the cell"}, "a group of four"},
        {numbered(';', ',', "."), "Northing\n1234.567\n", {"error 2:1 the cell"}, "a first group of four"},
        {numbered(';', ',', "."), "Northing\n.567\n", {"error 2:1 the cell"}, "no first group"},
        {numbered(';', ',', "."), "Northing\n1,234.567\n", {"error 2:1 the cell"}, "thousands in the fraction"},
        {numbered(';', ',', "."), "Northing\n1..234\n", {"error 2:1 the cell"}, "two marks"},
        {numbered(';', '.', ","), "Northing\n1,234.5\n", {"northing=1234.5"}, "commas between thousands"},
        {numbered(';', '.', " "), "Northing\n 1 234.5 \n", {"northing=1234.5"}, "blanks between thousands"},
        {numbered(';', '.', "\xE2\x80\xAF"),
         "Northing\n1\xE2\x80\xAF"
         "234.5\n",
         {"northing=1234.5"},
         "blanks of several bytes"},
        {numbered(';', '.', "'"), "Northing\n12'345'678\n", {"northing=12345678"}, "apostrophes"},
        {numbered(';', '.', "'"),
         "Angle\n45\xC2\xB0"
         "30'\n",
         {"angle=45.5"},
         "in an angle an apostrophe is a mark of minutes"},
        {numbered(';', ',', ""),
         "Station;Offset\n12+345,5;3,2 L\n",
         {"station=12345.5 offset=-3.2"},
         "in stations and offsets"},
        {numbered(';', ',', " "), "Offset\n1 003,2 L\n", {"offset=-1003.2"}, "the blank before a side is not a mark"},
        {numbered(';', ',', ""), "Bearing\nS 45-30-36,0 W\n", {"bearing=225.51"}, "in bearings"},
        {numbered(';', ',', ""), "Count;Flag\n5;*\n", {"count=5 flag=yes"}, "whole numbers and flags"},
    });
}

TEST(CsvDialect, LinesAreSkipped)
{
    check({
        {passing(2, {}, false),
         "Job 7\n\"open\nNumber,Count\n1,2\n",
         {"number=1 count=2"},
         "lines before the header row, whatever they hold"},
        {passing(2, {}, false),
         "Job 7\r\n\r\nNumber,Count\r\n1,x\r\n",
         {"error 4:3 the cell \"x\""},
         "they count as lines"},
        {passing(9, {}, false),
         "Number\n1\n",
         {"error 1:1 a header row of variable names was expected"},
         "more than there are"},
        {passing(0, '#', false), "# made today\nNumber,Count\n#1,2\n2,3\n# end\n", {"number=2 count=3"}, "comments"},
        {passing(0, '#', false),
         "Number,Description\n1,#a\n2,\"b\n# c\"\n",
         {"number=1 description=#a", "number=2 description=b\n# c"},
         "only at the beginning of a row"},
        {passing(0, '#', false),
         "#\n#x\nNumber,Count\n\n1,x\n",
         {"error 4:1 the row has 1 cells"},
         "a blank line is not a comment"},
        {passing(0, {}, true),
         "\nNumber,Count\n\n1,2\n \t\r\n2,3\n\n",
         {"number=1 count=2", "number=2 count=3"},
         "blank lines"},
        {passing(0, {}, true), "Number,Count\n\n\n1,x\n", {"error 4:3 the cell \"x\""}, "they count as lines"},
        {passing(0, {}, true), "Number\n \n1\n", {"number=1"}, "a blank line is not a point's number then"},
        {passing(1, ';', true), "x\n;\n\n;y\nNumber,Count\n1,2\n;\n\n", {"number=1 count=2"}, "all of them"},
        {passing(0, '#', false),
         "# nothing else",
         {"error 1:1 a header row of variable names was expected"},
         "comments alone"},
    });
    const char *bare = "a carriage return without a line feed was not expected";
    const QString inFirst = QStringLiteral("error 1:8 ") + QLatin1StringView(bare);
    check({
        {passing(1, {}, false), "Job 7 x\rNumber,Count\r1,2\r", {inFirst}, "lines that end with a carriage return"},
        {passing(0, '#', false), "# today\rNumber,Count\r1,2\r", {inFirst}, "a comment would be all of the file"},
        {passing(0, '#', false),
         "Number,Count\n1,2\n# end\r2,3\r",
         {"number=1 count=2", QStringLiteral("error 3:6 ") + QLatin1StringView(bare)},
         "the last comment as well"},
        {passing(1, '#', false), "x\r\n# y\r\nNumber,Count\r\n1,2\r\n# z\r", {"number=1 count=2"}, "with a line feed"},
    });
    CsvDialect dialect = spaced();
    dialect.passesBlankLines = true;
    check({{dialect, "Number Count\n\n  \n1 2\n", {"number=1 count=2"}, "with blanks as delimiters"}});
}

TEST(CsvDialect, SortingAndGoingBackFindsTheSameRows)
{
    CsvDialect dialect = passing(1, '#', true);
    dialect.kind = DelimiterKind::Whitespace;
    dialect.encoding = TextEncoding::Windows1252;
    QByteArray text = "skipped\n";
    text += "Number Description\n";
    for (int i = 0; i < 5000; ++i) {
        text += "#x\n\n " + QByteArray::number(4999 - i) + " \x80\n";
    }
    const JobFolder folder;
    folder.put("points.txt", text);
    const auto file = kareport::FileBytes::open(folder.path("points.txt"));
    kareport::CsvObjectList list(std::get<std::shared_ptr<const kareport::FileBytes>>(file), dialect,
                                 survey::variables(), {});
    EXPECT_EQ(survey::textOf(list.GetAt(4999)).toStdString(), "number=0 description=€");
    EXPECT_EQ(survey::textOf(list.GetAt(0)).toStdString(), "number=4999 description=€");
    list.Sort({survey::numberId});
    for (std::size_t i = 0; i < 5000; ++i) {
        ASSERT_EQ(survey::textOf(list.GetAt(i)), QStringLiteral("number=%1 description=€").arg(i));
    }
    EXPECT_EQ(list.GetAt(5000), nullptr);
    EXPECT_FALSE(list.error());
}

TEST(CsvDialect, TellsItsColumns)
{
    const JobFolder folder;
    folder.put("points.txt", "Number,Elev,Northing\n1,2,3\n");
    const auto file = kareport::FileBytes::open(folder.path("points.txt"));
    const kareport::CsvObjectList list(std::get<std::shared_ptr<const kareport::FileBytes>>(file), CsvDialect(),
                                       survey::variables(), {});
    const auto &columns = list.reader().columns();
    ASSERT_EQ(columns.size(), 3U);
    EXPECT_EQ(columns[1].name.toStdString(), "Elev");
    EXPECT_EQ(placeText(columns[1].place).toStdString(), "1:8");
    EXPECT_FALSE(columns[1].isKnown);
    EXPECT_TRUE(columns[0].isKnown && columns[2].isKnown);
    const kareport::CsvObjectList wrong(std::get<std::shared_ptr<const kareport::FileBytes>>(file),
                                        chosen({{"Elev", QStringLiteral("Elev")}}), survey::variables(), {});
    ASSERT_TRUE(wrong.reader().wrongChoice());
    EXPECT_EQ(wrong.reader().wrongChoice()->choice.toStdString(), "Elev") << "the job is wrong, not its data";
}

} // namespace
