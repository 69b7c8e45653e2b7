#include "UXmlReportTable.h"
#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateMarkup.h"

#include <gtest/gtest.h>

using markup::element;
using markup::field;

namespace
{

QByteArray templateOf(const QByteArray &tables)
{
    return element("ReportTemplate",
                   element("Name", "T") + element("Tables", tables) +
                       "<Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList><Variable><ID>4</ID>"
                       "<VariableName>A</VariableName><Type>TEXT</Type></Variable><Variable><ID>9</ID>"
                       "<VariableName>B</VariableName><Type>TEXT</Type></Variable></VariableList></Dictionary>"
                       "</Dictionaries><Options><Separator>;</Separator></Options>");
}

QByteArray tableOf(const char *name, const char *use, const QByteArray &fields, const QByteArray &sort = {})
{
    return element("Table", element("Name", name) + element("Use", use) + sort + element("OutputList", fields));
}

struct Row
{
    char separator;
    QByteArray fields;
    QString heading;
    const char *reason;
};

QString blanks(qsizetype count)
{
    return QString(count, u' ');
}

TEST(UXmlReportTable, BuildsTheHeading)
{
    const Row rows[] = {
        {'|', field("A", "Point", "8"), QStringLiteral("Point   "),
         "one column, filled to its width, no separator after it"},
        {'|', field("A", "Point", "8", "RIGHT"), QStringLiteral("   Point"), "right: the blanks come first"},
        {'|', field("A", "Point", "8", "CENTER"), QStringLiteral("Point   "), "centred: the heading is on the left"},
        {'|', field("A", "Point", "3"), QStringLiteral("Point"), "a label wider than its format is whole"},
        {'|', field("A", "", "3") + field("B", "", "2"), QStringLiteral("   |  "), "no labels"},
        {'|', field("A", "a", "2") + field("B", "b", "3", "RIGHT") + field("A", "c", "1"), QStringLiteral("a |  b|c"),
         "separators between the columns"},
        {' ', field("A", "a", "2") + field("B", "b", "2"), QStringLiteral("a  b "), "a blank between"},
        {'\t', field("A", "a", "9") + field("B", "b", "9", "RIGHT"), QStringLiteral("a\tb"),
         "a tab: nothing is filled"},
        {'\0', field("A", "a", "2") + field("B", "b", "1"), QStringLiteral("a ") + QChar(u'\0') + u'b',
         "the character 0 between"},
        {'\xE9', field("A", "a", "1") + field("B", "b", "1"), QStringLiteral("aéb"),
         "a character above 127 is Latin-1"},
        {'|', field("FILLER", "", "") + field("A", "Stn", "8", "RIGHT"), QStringLiteral("     Stn"),
         "a filler is followed directly by five blanks and its column's label"},
        {'|', field("Filler", "xy", "4") + field("A", "a", "1"), QStringLiteral("xy  a"),
         "a filler with a label, any case"},
        {'|', field("A", "a", "1") + field("SUFFIX_R", "", "") + field("B", "b", "1"), QStringLiteral("a|b"),
         "a suffix joins the column after it"},
        {'|', field("A", "a", "1") + field("suffix_+", "", "") + field("B", "b", "1"), QStringLiteral("a|b"),
         "the other suffix, any case"},
        {'|', field("A", "a", "1") + field("FILLER", "", ""), QStringLiteral("a|"), "a filler at the end"},
        {'\t', field("FILLER", "x", "3") + field("A", "a", "3"), QStringLiteral("xa"), "a filler with a tab separator"},
        {'|', field("A", "a", "99"), QStringLiteral("a") + blanks(98), "98 blanks fill one column"},
        {'|', field("A", "a", "100"), QStringLiteral("a") + blanks(98), "no more than 98 blanks fill one column"},
        {'|', field("A", "a", "500", "RIGHT") + field("B", "b", "1"), blanks(98) + QStringLiteral("a|b"),
         "no more than 98 blanks before a label"},
        {'|', field("A", "点\U0001F600", "4") + field("B", "b", "1"), QStringLiteral("点\U0001F600 |b"),
         "widths count 16-bit characters"},
    };
    for (const Row &row : rows) {
        const LoadedTemplate loaded(templateOf(tableOf("X", "D", row.fields)));
        ASSERT_TRUE(loaded.loaded) << row.reason;
        UXmlReportTable table;
        table.SetColumnSeparator(row.separator);
        ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl)) << row.reason;
        EXPECT_EQ(table.GetHeading(), row.heading) << row.reason;
    }
}

TEST(UXmlReportTable, PutsTheCharacter255BetweenTheColumnsUntilASeparatorIsSet)
{
    const LoadedTemplate loaded(templateOf(tableOf("X", "D", field("A", "a", "1") + field("B", "b", "1"))));
    UXmlReportTable table;
    EXPECT_EQ(table.GetColumnSeparator(), QStringLiteral("\u00FF"));
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    EXPECT_EQ(table.GetHeading(), QStringLiteral("a\u00FFb")) << "the template's own separator is not looked at";
    table.SetColumnSeparator('|');
    EXPECT_EQ(table.GetColumnSeparator(), QStringLiteral("|"));
    EXPECT_EQ(table.GetHeading(), QStringLiteral("a\u00FFb")) << "the heading is not built by itself";
    table.ReorderingHeading();
    EXPECT_EQ(table.GetHeading(), QStringLiteral("a|b"));
}

TEST(UXmlReportTable, BuildsTheHeadingAgainAfterReordering)
{
    LoadedTemplate loaded(
        templateOf(tableOf("X", "D", field("Northing", "North", "7") + field("Easting", "East", "6", "RIGHT"))));
    UXmlReportTable table;
    table.SetColumnSeparator('|');
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    EXPECT_EQ(table.GetHeading(), QStringLiteral("North  |  East"));
    ASSERT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_EASTING_NORTHING));
    table.ReorderingHeading();
    EXPECT_EQ(table.GetHeading(), QStringLiteral("  East|North  ")) << "widths and labels move together";
    EXPECT_EQ(table.GetField(0).VariableName, QStringLiteral("Easting"));
}

TEST(UXmlReportTable, AnEmptyHeadingLeavesTheOldOne)
{
    const LoadedTemplate loaded(templateOf(tableOf("X", "D", field("A", "a", "1")) + tableOf("None", "D", "") +
                                           tableOf("Blank", "D", field("A", "", ""))));
    UXmlReportTable table;
    ASSERT_TRUE(table.LoadTable(QStringLiteral("None"), &loaded.tpl));
    EXPECT_EQ(table.GetHeading(), QString());
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    EXPECT_EQ(table.GetHeading(), QStringLiteral("a"));
    for (const char *name : {"None", "Blank"}) {
        ASSERT_TRUE(table.LoadTable(QString::fromLatin1(name), &loaded.tpl));
        EXPECT_EQ(table.GetHeading(), QStringLiteral("a")) << name;
    }
}

TEST(UXmlReportTable, AFailedLoadLeavesTheOldHeadingAndSoDoesReordering)
{
    const LoadedTemplate loaded(
        templateOf(tableOf("X", "D", field("A", "a", "3")) + tableOf("Lost", "Missing", field("B", "b", "4"))));
    UXmlReportTable table;
    table.SetColumnSeparator('|');
    for (const char *name : {"Unknown", "Lost", ""}) {
        ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
        EXPECT_FALSE(table.LoadTable(QString::fromLatin1(name), &loaded.tpl)) << name;
        EXPECT_FALSE(table.IsLoaded()) << name;
        EXPECT_EQ(table.GetHeading(), QStringLiteral("a  ")) << name;
        table.ReorderingHeading();
        EXPECT_EQ(table.GetHeading(), QStringLiteral("a  ")) << name;
    }
    EXPECT_FALSE(table.LoadTable(QStringLiteral("X"), nullptr));
    table.ReorderingHeading();
    EXPECT_EQ(table.GetHeading(), QStringLiteral("a  ")) << "no template";
}

TEST(UXmlReportTable, ReorderingANewHandleGivesNoHeading)
{
    UXmlReportTable table;
    EXPECT_EQ(table.GetHeading(), QString());
    table.ReorderingHeading();
    EXPECT_EQ(table.GetHeading(), QString());
}

TEST(UXmlReportTable, AFillersLabelIsFollowedDirectlyByFiveBlanksAndStn)
{
    const LoadedTemplate loaded(templateOf(
        tableOf("X", "D", field("FILLER", "*", "1") + field("A", "Stn", "8", "RIGHT") + field("B", "b", "1"))));
    UXmlReportTable table;
    table.SetColumnSeparator('|');
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    EXPECT_EQ(table.GetHeading(), QStringLiteral("*     Stn|b"));
}

TEST(UXmlReportTable, GivesTheSortKeysIdentifiers)
{
    const LoadedTemplate loaded(
        templateOf(tableOf("X", "D", "", "<Sort><VariableName>B</VariableName><VariableName>a</VariableName></Sort>") +
                   tableOf("Unsorted", "D", "")));
    UXmlReportTable table;
    std::vector<quint32> ids{1, 2, 3};
    table.GetSortList(ids);
    EXPECT_TRUE(ids.empty()) << "nothing is loaded";
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    ids = {1, 2, 3};
    table.GetSortList(ids);
    EXPECT_EQ(ids, (std::vector<quint32>{9, 4}));
    ASSERT_TRUE(table.LoadTable(QStringLiteral("Unsorted"), &loaded.tpl));
    table.GetSortList(ids);
    EXPECT_TRUE(ids.empty()) << "no sort keys";
}

TEST(UXmlReportTable, GivesItsFieldsAndEmptyOnesOutside)
{
    const LoadedTemplate loaded(
        templateOf(tableOf("Points", "d", field("A", "a", "5.2", "RIGHT") + field("B", "b", "6"))));
    UXmlReportTable table;
    EXPECT_EQ(table.GetFieldsCount(), 0);
    EXPECT_EQ(table.GetField(0).VariableName, QString());
    ASSERT_TRUE(table.LoadTable(QStringLiteral("POINTS"), &loaded.tpl));
    EXPECT_EQ(table.GetTableName(), QStringLiteral("Points"));
    EXPECT_EQ(table.GetFieldsCount(), 2);
    const sXmlReportField first = table.GetField(0);
    EXPECT_EQ(first.VariableName, QStringLiteral("A"));
    EXPECT_EQ(first.Width, 5);
    EXPECT_EQ(first.Decimals, 2);
    EXPECT_EQ(first.Align, QStringLiteral("R"));
    EXPECT_EQ(first.ID, 4);
    EXPECT_EQ(first.Type, 2);
    EXPECT_EQ(table.GetField(1).ID, 9);
    for (const int outside : {-1, 2, 1000, -2147483647}) {
        const sXmlReportField none = table.GetField(outside);
        EXPECT_EQ(none.VariableName + none.Label + none.Align, QString()) << outside;
        EXPECT_EQ(none.Width, 0) << outside;
        EXPECT_EQ(none.Decimals, 0) << outside;
        EXPECT_EQ(none.ID, 0) << outside;
        EXPECT_EQ(none.Type, 0) << outside;
    }
}

TEST(UXmlReportTable, FailsAndPointsToNothing)
{
    const LoadedTemplate loaded(templateOf(
        tableOf("X", "D", field("A", "a", "1"), "<Sort><VariableName>A</VariableName></Sort>") +
        tableOf("NoDictionary", "Missing", field("A", "a", "1")) + tableOf("NoUse", "", field("A", "a", "1"))));
    ASSERT_TRUE(loaded.loaded);
    const struct
    {
        const char *name;
        const UXmlReportTpl *tpl;
        const char *reason;
    } rows[] = {
        {"X", nullptr, "no template"},
        {"Y", &loaded.tpl, "no such table"},
        {"", &loaded.tpl, "no name"},
        {"NoDictionary", &loaded.tpl, "the dictionary is missing"},
        {"NoUse", &loaded.tpl, "no dictionary is named"},
    };
    for (const auto &row : rows) {
        UXmlReportTable table;
        ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
        EXPECT_FALSE(table.LoadTable(QString::fromLatin1(row.name), row.tpl)) << row.reason;
        EXPECT_EQ(table.GetFieldsCount(), 0) << row.reason;
        EXPECT_EQ(table.GetField(0).VariableName, QString()) << row.reason;
        std::vector<quint32> ids{1};
        table.GetSortList(ids);
        EXPECT_TRUE(ids.empty()) << row.reason;
    }
}

TEST(UXmlReportTable, CopiesPointToTheSameRecords)
{
    LoadedTemplate loaded(templateOf(tableOf("X", "D", field("Northing", "n", "1") + field("Easting", "e", "1"))));
    UXmlReportTable table;
    table.SetColumnSeparator('|');
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    const UXmlReportTable copy = table;
    EXPECT_EQ(copy.GetHeading(), QStringLiteral("n|e"));
    EXPECT_EQ(copy.GetColumnSeparator(), QStringLiteral("|"));
    ASSERT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_EASTING_NORTHING));
    EXPECT_EQ(copy.GetField(0).VariableName, QStringLiteral("Easting"));
    EXPECT_EQ(copy.GetTableName(), QStringLiteral("X"));
}

} // namespace
