#include "VariableType.h"
#include "XlsxResult.h"

#include <gtest/gtest.h>

#include <string>

// What does not fit into a sheet goes on in a further one. How many sheets there are is seen in the book's own list of them.

namespace
{

constexpr lxw_row_t rowsOfSheet = 4;

kareport::ResultTable countTable(const UJobSettings &settings, bool isTable)
{
    kareport::ResultColumn column;
    column.field.VariableName = QStringLiteral("Count");
    column.field.Label = QStringLiteral("Count");
    column.field.Type = VARIABLE_INTEGER;
    kareport::ResultTable table;
    table.name = QStringLiteral("Points");
    table.isTable = isTable;
    table.settings = &settings;
    table.columns = {column};
    return table;
}

void addRow(kareport::XlsxResult &result)
{
    const UDictEntry entry(1, qint32(7));
    kareport::ResultRow row;
    row.cells = {{&entry, u"7"}};
    result.addRow(row);
}

/// How many sheets a finished book has: the name of each one's file is in its list twice.
int sheetsOf(kareport::XlsxResult &result)
{
    EXPECT_TRUE(result.finish()) << result.problem().toStdString();
    const std::string bytes(result.bytes());
    int sheets = 0;
    while (bytes.find("xl/worksheets/sheet" + std::to_string(sheets + 1) + ".xml") != std::string::npos) {
        ++sheets;
    }
    return sheets;
}

TEST(XlsxFurtherSheet, LinesGoOnInIt)
{
    for (const bool isOne : {false, true}) {
        kareport::ResultOptions options;
        options.isOneSheet = isOne;
        kareport::XlsxResult result(options, rowsOfSheet);
        for (int line = 0; line < 9; ++line) {
            result.addText(kareport::ResultText::Line, u"x", 0);
        }
        EXPECT_EQ(sheetsOf(result), 3) << isOne;
    }
}

TEST(XlsxFurtherSheet, BlocksGoOnInIt)
{
    const UJobSettings settings;
    kareport::XlsxResult result(kareport::ResultOptions(), rowsOfSheet);
    for (int block = 0; block < 5; ++block) {
        ASSERT_TRUE(result.beginTable(countTable(settings, false)));
        addRow(result);
        result.endTable();
    }
    EXPECT_EQ(sheetsOf(result), 2);
}

TEST(XlsxFurtherSheet, ColumnsBeyondItsLastOneAreLeftOut)
{
    struct Row
    {
        std::size_t columns;
        bool endsWithBearing;
        const char *warning;
        const char *reason;
    };
    const Row rows[] = {
        {16'384, false, "", "as many as a sheet has"},
        {16'385, false, "1 columns are more than a sheet of a workbook holds, and are left out", "one more"},
        {16'383, true, "", "a bearing with the column of its degrees"},
        {16'384, true, "1 columns are more than a sheet of a workbook holds, and are left out",
         "there is no room for the degrees of the last one"},
    };
    const UJobSettings settings;
    for (const Row &row : rows) {
        kareport::ResultOptions options;
        options.bearingValues = true;
        kareport::XlsxResult result(options);
        kareport::ResultTable table = countTable(settings, true);
        table.columns.resize(row.columns, table.columns.front());
        if (row.endsWithBearing) {
            table.columns.back().field.Type = VARIABLE_BEARING;
        }
        ASSERT_TRUE(result.beginTable(table));
        result.endTable();
        EXPECT_TRUE(result.finish()) << result.problem().toStdString();
        EXPECT_EQ(result.warnings().join(u'\n').toStdString(), row.warning) << row.reason;
    }
}

TEST(XlsxFurtherSheet, TablesGoOnInIt)
{
    const UJobSettings settings;
    for (const bool isOne : {false, true}) {
        kareport::ResultOptions options;
        options.isOneSheet = isOne;
        kareport::XlsxResult result(options, rowsOfSheet);
        for (int table = 0; table < 2; ++table) {
            ASSERT_TRUE(result.beginTable(countTable(settings, true)));
            for (int row = 0; row < 4; ++row) {
                addRow(result);
            }
            result.endTable();
        }
        EXPECT_EQ(sheetsOf(result), 4) << isOne << ": three rows under each heading";
    }
}

} // namespace
