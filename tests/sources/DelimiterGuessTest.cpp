#include "SurveyRows.h"

#include <gtest/gtest.h>

namespace
{

using kareport::CsvDialect;
using kareport::DelimiterKind;

CsvDialect automatic(const char *order = "", char decimal = '.')
{
    CsvDialect dialect;
    dialect.kind = DelimiterKind::Automatic;
    dialect.order = QString::fromUtf8(order);
    dialect.hasHeader = dialect.order.isEmpty();
    dialect.numbers.decimal = decimal;
    return dialect;
}

TEST(DelimiterGuess, FindsTheOnlyReading)
{
    struct Row
    {
        CsvDialect dialect;
        QByteArray text;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {automatic(), "Number,Northing\n1,2\n", "number=1 northing=2", "commas"},
        {automatic(), "Number;Northing\n1;2\n", "number=1 northing=2", "semicolons"},
        {automatic(), "Number\tNorthing\n1\t2\n", "number=1 northing=2", "tabs, though blanks read the same"},
        {automatic(), "Number|Northing\n1|2\n", "number=1 northing=2", "vertical bars"},
        {automatic(), "Number  Northing\n 1   2\n", "number=1 northing=2", "blanks"},
        {automatic(), "Number, Northing, Easting\n1, 2, 3\n", "number=1 northing=2 easting=3",
         "commas and blanks: less is known with blanks"},
        {automatic("", ','), "Number;Northing\n1;2,5\n", "number=1 northing=2.5",
         "the decimal comma is not a delimiter"},
        {automatic(), "Number;Description\n1;a, b\n", "number=1 description=a, b", "a comma in a text"},
        {automatic(), "Number;Description\n1;\"a;b\"\n", "number=1 description=a;b", "in quotes"},
        {automatic("PNEZD"), "1,2,3,4,TREE OAK\n", "number=1 northing=2 easting=3 elevation=4 description=TREE OAK",
         "an order, with a blank in a text"},
        {automatic("PNEZD"), "1 2 3 4 TREE\n", "number=1 northing=2 easting=3 elevation=4 description=TREE",
         "an order and blanks"},
        {automatic("P-"), "\"a b\";c\n", "number=a b", "quotes tell"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(survey::rowsOf(row.text, row.dialect).join(u'\n').toStdString(), row.expected) << row.reason;
    }
}

TEST(DelimiterGuess, SaysWhatCannotBeFoundOut)
{
    struct Row
    {
        CsvDialect dialect;
        QByteArray text;
        const char *contains;
        const char *reason;
    };
    CsvDialect misspelt = automatic();
    misspelt.columns = {{QStringLiteral("Elev"), 1}};
    CsvDialect absent = automatic();
    absent.columns = {{QStringLiteral("Elevation"), QStringLiteral("Elv")}};
    const Row rows[] = {
        {automatic("PD"), "A B,C\n", "it may be the comma or blanks and tabs", "two readings"},
        {automatic("PD"), "1, 2\n", "it may be the comma or blanks and tabs", "a text may end with a comma"},
        {automatic("PD"), "A;B,C\nD;E,F\n", "it may be the comma or the semicolon", "two readings"},
        {automatic("PD"), "A|B;C D\nD|E;F G\n", "it may be the semicolon or the vertical bar or blanks and tabs",
         "three readings"},
        {automatic(), "Number\n1\n", "cannot be determined: with a comma", "one column"},
        {automatic(), "", "error 1:1 a header row of variable names was expected", "nothing, with any delimiter"},
        {automatic(), "Number;North\xFFing\n1;2\n", "error 1:13 the file is not UTF-8", "wrong with any delimiter"},
        {automatic(), "a,b\n1,2\n", "error 1:1 no column of the header row is a variable", "no variable"},
        {absent, "Number;Elev\n1;2\n", "error 1:1 there is no column \"Elv\": did you mean \"Elev\"?",
         "a column that one delimiter alone could give"},
        {automatic(), "Number,Count;Northing,Easting;Flag\n1,2\n", "cannot be determined: with a comma",
         "two that find columns"},
        {automatic("PNEZD"), "1,2,3\n", "error 1:5 the row has 3 cells: 5 were expected", "too few cells with any"},
        {automatic(), "Number,Northing\n1,2\n2,x\n", "error 3:3 the cell \"x\" of the column \"Northing\"",
         "the header row tells, and the row is wrong"},
        {automatic(), "Number,Northing\n1,2\n2\n", "error 3:1 the row has 1 cells", "a cell is missing"},
        {misspelt, "Number,Northing\n1,2\n", "the dictionary has no variable \"Elev\": did you mean",
         "no delimiter makes that right"},
        {automatic("PX"), "1,2\n", "\"PX\" is not an order", "nor that"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(survey::rowsOf(row.text, row.dialect).join(u'\n').contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << survey::rowsOf(row.text, row.dialect).join(u'\n').toStdString();
    }
}

} // namespace
