#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateMarkup.h"
#include "UXmlReportTpl.h"

#include <gtest/gtest.h>

#include <string>

using markup::element;
using markup::joined;
using markup::variable;

namespace
{

QByteArray templateOf(const QByteArray &body)
{
    return element("ReportTemplate", element("Name", "T") + body);
}

QByteArray dictionary(const char *name, const std::vector<QByteArray> &variables)
{
    return element("Dictionary", element("DictionaryName", name) + element("VariableList", joined(variables)));
}

QByteArray fieldOf(const char *variableName)
{
    return element("Field", element("VariableName", variableName));
}

/// Fields as "name:id:type", with a blank between.
std::string shown(const sXmlReportFields &fields)
{
    QStringList texts;
    for (const sXmlReportField &field : fields) {
        texts.append(field.VariableName + u':' + QString::number(field.ID) + u':' + QString::number(field.Type));
    }
    return texts.join(u' ').toStdString();
}

TEST(UXmlReportTplRecords, CutsATablesPartsInTheirOrder)
{
    // The first name in the table is its own, whatever follows; so with the other parts.
    const LoadedTemplate loaded(templateOf("<Tables><Table><Sort><VariableName>B</VariableName></Sort>"
                                           "<OutputList><Field><Align>RIGHT</Align><VariableName>A</VariableName>"
                                           "<Label> La bel </Label><Format>10.3</Format></Field></OutputList>"
                                           "<Use>Dic</Use><Name>Points</Name><Name>More</Name></Table></Tables>"));
    const sXmlReportTable *table = loaded.tpl.GetTable(QStringLiteral("points"));
    ASSERT_NE(table, nullptr);
    EXPECT_EQ(table->Name, QStringLiteral("Points"));
    EXPECT_EQ(table->Use, QStringLiteral("Dic"));
    ASSERT_EQ(table->Fields.size(), 1U);
    EXPECT_EQ(table->Fields[0].VariableName, QStringLiteral("A"));
    EXPECT_EQ(table->Fields[0].Label, QStringLiteral(" La bel "));
    EXPECT_EQ(table->Fields[0].Width, 10);
    EXPECT_EQ(table->Fields[0].Decimals, 3);
    EXPECT_EQ(table->Fields[0].Align, QStringLiteral("R"));
}

TEST(UXmlReportTplRecords, ShortClosingTagsDropByTheOrderOfTheCuts)
{
    // Closed by the short form, each part takes as many characters with it as its name has. A table cuts the format
    // first, a block the variable's name.
    const QByteArray fields = "<OutputList><Field><VariableName>A</>variablename<Format>10</>format<Label>x</>label"
                              "<Align>RIGHT</>align</Field></OutputList>";
    const LoadedTemplate loaded(templateOf("<Tables><Table><Name>X</Name>" + fields +
                                           "</Table></Tables><Blocks><Block>"
                                           "<Name>X</Name>" +
                                           fields + "</Block></Blocks>"));
    const sXmlReportTable *table = loaded.tpl.GetTable(QStringLiteral("X"));
    const sXmlReportBlock *block = loaded.tpl.GetBlock(QStringLiteral("X"));
    ASSERT_NE(table, nullptr);
    ASSERT_NE(block, nullptr);
    for (const sXmlReportFields *read : {&table->Fields, &block->Fields}) {
        ASSERT_EQ(read->size(), 1U);
        EXPECT_EQ(read->front().VariableName, QStringLiteral("A"));
        EXPECT_EQ(read->front().Label, QStringLiteral("x"));
        EXPECT_EQ(read->front().Width, 10);
        EXPECT_EQ(read->front().Align, QStringLiteral("R"));
    }
}

TEST(UXmlReportTplRecords, TableAndBlockFieldsAreCutInDifferentOrders)
{
    // The first part that is cut takes the begin of the next one's tag with it.
    const QByteArray fields = "<OutputList><Field><VariableName>A</><Format>1</Format>23456789<Label>x</Label></Field>"
                              "</OutputList>";
    const LoadedTemplate loaded(templateOf("<Tables><Table><Name>X</Name>" + fields +
                                           "</Table></Tables><Blocks><Block>"
                                           "<Name>X</Name>" +
                                           fields + "</Block></Blocks>"));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportField table = loaded.tpl.GetTable(QStringLiteral("X"))->Fields.at(0);
    const sXmlReportField block = loaded.tpl.GetBlock(QStringLiteral("X"))->Fields.at(0);
    EXPECT_EQ(table.VariableName, QStringLiteral("A"));
    EXPECT_EQ(table.Width, 1) << "the format is cut before the name's short closing tag can harm it";
    EXPECT_EQ(block.VariableName, QStringLiteral("A"));
    EXPECT_EQ(block.Width, 0) << "<Format>1</ went with the name";
}

TEST(UXmlReportTplRecords, AVariablesPartsAreLookedUpAndNotCutOut)
{
    // Were a part cut out, its short closing tag would take the beginning of the next one along.
    struct Row
    {
        const char *variable;
        const char *shown;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<ID>1</><VariableName>A</><Type>TEXT</>", "A:1:2", "each closed by the short form, nothing in between"},
        {"<Type>TEXT</><VariableName>A</><ID>1</>", "A:1:2", "in any order"},
        {"<ID>1</><VariableName>A</VariableName><Type>TEXT</Type>", "A:1:2", "the short form alone in its element"},
        {"<ID>1</>id<VariableName>A</>variablename<Type>TEXT</Type>", "A:1:2", "with what a cut would have dropped"},
        {"<ID>1</ID><VariableName>A</VariableName><Type>TEXT</Type>", "A:1:2", "full closing tags"},
        {"<VariableName><ID>1</ID>A</VariableName><Type>TEXT</Type>", "<ID>1</ID>A:1:2",
         "a part inside another stays in it"},
    };
    for (const Row &row : rows) {
        const LoadedTemplate loaded(
            templateOf(element("Dictionaries", dictionary("D", {element("Variable", row.variable)}))));
        ASSERT_TRUE(loaded.loaded) << row.reason;
        const sXmlReportDictionary *read = loaded.tpl.GetDictionary(QStringLiteral("D"));
        ASSERT_NE(read, nullptr) << row.reason;
        ASSERT_EQ(read->Variables.size(), 1U) << row.reason;
        const sXmlReportVariable &variable = read->Variables[0];
        EXPECT_EQ(QStringLiteral("%1:%2:%3").arg(variable.VariableName).arg(variable.ID).arg(variable.Type),
                  QString::fromUtf8(row.shown))
            << row.reason;
    }
}

TEST(UXmlReportTplRecords, KeepsTablesAndDictionariesWithoutContent)
{
    const LoadedTemplate loaded(
        templateOf("<Tables><Table><Name>Empty</Name></Table><Table> </Table></Tables>"
                   "<Dictionaries><Dictionary><DictionaryName>None</DictionaryName></Dictionary>"
                   "</Dictionaries><Blocks><Block><Name>Bare</Name></Block></Blocks>"));
    ASSERT_TRUE(loaded.loaded);
    QStringList names;
    loaded.tpl.GetAllTables(names);
    EXPECT_EQ(names, QStringList({QStringLiteral("Empty"), QString()}));
    loaded.tpl.GetAllDictionaries(names);
    EXPECT_EQ(names, QStringList(QStringLiteral("None")));
    loaded.tpl.GetAllBlocks(names);
    EXPECT_EQ(names, QStringList(QStringLiteral("Bare")));
    EXPECT_EQ(loaded.tpl.GetTable(QString()), nullptr) << "an empty name finds nothing, also where a table has none";
    EXPECT_EQ(loaded.tpl.GetBlock(QStringLiteral("Bar")), nullptr);
    EXPECT_NE(loaded.tpl.GetDictionary(QStringLiteral("NONE")), nullptr);
    EXPECT_TRUE(loaded.tpl.GetDictionary(QStringLiteral("NONE"))->Variables.empty());
}

TEST(UXmlReportTplRecords, OfTwoRecordsOfOneNameTheFirstIsFound)
{
    const LoadedTemplate loaded(templateOf("<Tables><Table><Name>A</Name><Use>1</Use></Table>"
                                           "<Table><Name>a</Name><Use>2</Use></Table></Tables>"));
    ASSERT_NE(loaded.tpl.GetTable(QStringLiteral("a")), nullptr);
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("a"))->Use, QStringLiteral("1"));
}

TEST(UXmlReportTplRecords, ReadsVariablesAndDropsThoseOfUnknownType)
{
    const LoadedTemplate loaded(templateOf(
        element("Dictionaries",
                dictionary("D", {variable(1, "A", "Thickness"), variable(2, "B", "Radius"),
                                 element("Variable", "<ID> 12x</ID><VariableName>C</VariableName><Type>text</Type>"),
                                 element("Variable", "<VariableName>D</VariableName><Type>FLAG</Type>"),
                                 element("Variable", "<ID>5</ID><VariableName>E</VariableName>"),
                                 variable(-6, "F", "INTEGER")}))));
    const sXmlReportDictionary *read = loaded.tpl.GetDictionary(QStringLiteral("d"));
    ASSERT_NE(read, nullptr);
    std::string texts;
    for (const sXmlReportVariable &found : read->Variables) {
        texts +=
            found.VariableName.toStdString() + ':' + std::to_string(found.ID) + ':' + std::to_string(found.Type) + ' ';
    }
    EXPECT_EQ(texts, "A:1:22 C:12:2 D:0:20 F:-6:0 ");
}

const QByteArray twoDictionaries =
    element("Dictionaries", dictionary("D", {variable(1, "A", "LENGTH"), variable(2, "B", "OFFSET")}) +
                                dictionary("E", {variable(7, "A", "AREA")}));

TEST(UXmlReportTplRecords, FieldOfATableWithoutAVariableGetsZeros)
{
    const LoadedTemplate loaded(templateOf(
        element("Tables", element("Table", "<Name>X</Name><Use>d</Use>" +
                                               element("OutputList",
                                                       fieldOf("Nix") + fieldOf("b") + fieldOf("Nix") + fieldOf("A"))) +
                              element("Table", "<Name>Y</Name><Use>none</Use>" + element("OutputList", fieldOf("A")))) +
        twoDictionaries));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(shown(loaded.tpl.GetTable(QStringLiteral("X"))->Fields), "Nix:0:0 b:2:10 Nix:0:0 A:1:6");
    EXPECT_EQ(shown(loaded.tpl.GetTable(QStringLiteral("Y"))->Fields), "A:0:0") << "no such dictionary";
}

TEST(UXmlReportTplRecords, FieldOfABlockWithoutAVariableTakesWhatTheOneBeforeHad)
{
    const LoadedTemplate loaded(templateOf(
        element(
            "Blocks",
            element("Block", "<Name>X</Name><Use>D</Use>" +
                                 element("OutputList", fieldOf("Nix") + fieldOf("B") + fieldOf("Nix") + fieldOf("A"))) +
                element("Block", "<Name>Y</Name><Use>E</Use>" +
                                     element("OutputList", fieldOf("Nix") + fieldOf("A") + fieldOf("B"))) +
                element("Block", "<Name>Z</Name><Use>none</Use>" + element("OutputList", fieldOf("A")))) +
        twoDictionaries));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(shown(loaded.tpl.GetBlock(QStringLiteral("X"))->Fields), "Nix:0:0 B:2:10 Nix:2:10 A:1:6");
    EXPECT_EQ(shown(loaded.tpl.GetBlock(QStringLiteral("Y"))->Fields), "Nix:1:6 A:7:11 B:7:11") << "across blocks";
    EXPECT_EQ(shown(loaded.tpl.GetBlock(QStringLiteral("Z"))->Fields), "A:7:11") << "across blocks, no dictionary";
}

TEST(UXmlReportTplRecords, OfSeveralMatchesTheLastWins)
{
    const LoadedTemplate loaded(templateOf(
        element("Tables",
                element("Table", "<Name>X</Name><Use>D</Use>" + element("OutputList", fieldOf("A") + fieldOf("B")))) +
        element("Dictionaries",
                dictionary("D", {variable(1, "A", "LENGTH"), variable(2, "a", "OFFSET"), variable(3, "B", "TEXT")}) +
                    dictionary("other", {variable(8, "A", "TEXT")}) +
                    dictionary("d", {variable(9, "A", "AREA"), variable(10, "B", "Radius")}))));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(shown(loaded.tpl.GetTable(QStringLiteral("X"))->Fields), "A:9:11 B:3:2")
        << "of variables in one dictionary and of dictionaries of one name; one of unknown type is not found";
    qint32 id = -5;
    qint32 type = -6;
    EXPECT_TRUE(loaded.tpl.FindVariable(QStringLiteral("D"), QStringLiteral("a"), id, type));
    EXPECT_EQ(id, 9);
    EXPECT_EQ(type, 11);
    EXPECT_FALSE(loaded.tpl.FindVariable(QStringLiteral("D"), QStringLiteral("C"), id, type));
    EXPECT_FALSE(loaded.tpl.FindVariable(QStringLiteral("none"), QStringLiteral("A"), id, type));
    EXPECT_EQ(id, 9) << "no match changes nothing";
    EXPECT_EQ(type, 11);
}

TEST(UXmlReportTplRecords, SortListsHoldWhatTheirTablesNameAndCarryIdentifiersOn)
{
    const auto table = [](const char *name, const char *use, const QByteArray &sort) {
        return element("Table", element("Name", name) + element("Use", use) + sort);
    };
    const auto sort = [](std::initializer_list<const char *> names) {
        QByteArray keys;
        for (const char *name : names) {
            keys += element("VariableName", name);
        }
        return element("Sort", keys);
    };
    const LoadedTemplate loaded(
        templateOf(element("Tables", table("First", "D", sort({"Nix", "b", "Nix", "A"})) + table("None", "D", "") +
                                         table("Empty", "D", sort({})) + table("Last", "E", sort({"Nix", "A"}))) +
                   twoDictionaries));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(loaded.tpl.GetSortList(QStringLiteral("None")), nullptr);
    EXPECT_EQ(loaded.tpl.GetSortList(QStringLiteral("Empty")), nullptr);
    EXPECT_EQ(loaded.tpl.GetSortList(QString()), nullptr);
    const struct
    {
        const char *name;
        const char *use;
        const char *entries;
    } rows[] = {{"FIRST", "D", "Nix:0 b:2 Nix:2 A:1 "}, {"last", "E", "Nix:1 A:7 "}};
    for (const auto &row : rows) {
        const sXmlSortTableReport *list = loaded.tpl.GetSortList(QString::fromLatin1(row.name));
        ASSERT_NE(list, nullptr) << row.name;
        EXPECT_EQ(list->Use, QString::fromLatin1(row.use)) << row.name;
        std::string entries;
        for (const sXmlSortVariable &entry : list->Entries) {
            entries += entry.VariableName.toStdString() + ':' + std::to_string(entry.ID) + ' ';
        }
        EXPECT_EQ(entries, row.entries) << row.name;
    }
}

constexpr struct
{
    const char *before;
    ORIENTATION_ORDER order;
    const char *after;
    const char *reason;
} orderRows[] = {
    {"Northing Easting Elevation", ORDER_EASTING_NORTHING, "Easting Northing Elevation", "swapped"},
    {"Northing Easting Elevation", ORDER_NORTHING_EASTING, "Northing Easting Elevation", "right already"},
    {"Easting Northing", ORDER_NORTHING_EASTING, "Northing Easting", "swapped the other way"},
    {"Easting Northing", ORDER_EASTING_NORTHING, "Easting Northing", "right already"},
    {"A northing B EASTING C", ORDER_EASTING_NORTHING, "A EASTING B northing C", "any case, others between them"},
    {"Elevation", ORDER_EASTING_NORTHING, "Elevation", "neither of the two"},
    {"Northing Elevation", ORDER_EASTING_NORTHING, "Northing Elevation", "only one of the two stays as it is"},
    {"Elevation Easting", ORDER_NORTHING_EASTING, "Elevation Easting", "only the other one stays as it is"},
    {"Northing Northing", ORDER_EASTING_NORTHING, "Northing Northing", "one of the two, twice"},
    {"Northing NORTHING Easting easting", ORDER_EASTING_NORTHING, "easting easting NORTHING NORTHING",
     "of several, the last of each replaces all"},
    {"Easting Northing NORTHING", ORDER_EASTING_NORTHING, "Easting Northing NORTHING", "the first one decides"},
};

TEST(UXmlReportTplRecords, PutsNorthingAndEastingIntoAnOrder)
{
    for (const auto &row : orderRows) {
        QByteArray fields;
        for (const QByteArray &name : QByteArray(row.before).split(' ')) {
            fields += element("Field", element("VariableName", name) + element("Label", "Label of " + name) +
                                           element("Format", QByteArray::number(40 + name.size())));
        }
        LoadedTemplate loaded(
            templateOf(element("Tables", element("Table", "<Name>Other</Name>" + element("OutputList", fields)) +
                                             element("Table", "<Name>X</Name>" + element("OutputList", fields)))));
        ASSERT_TRUE(loaded.loaded);
        EXPECT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("x"), row.order)) << row.reason;
        const auto check = [&](const char *table, const char *expected) {
            QStringList names;
            for (const sXmlReportField &field : loaded.tpl.GetTable(QString::fromLatin1(table))->Fields) {
                names.append(field.VariableName);
                EXPECT_EQ(field.Label, QStringLiteral("Label of ") + field.VariableName) << row.reason;
                EXPECT_EQ(field.Width, 40 + field.VariableName.size()) << row.reason;
            }
            EXPECT_EQ(names.join(u' '), QString::fromLatin1(expected)) << row.reason;
        };
        check("X", row.after);
        check("Other", row.before);
    }
}

TEST(UXmlReportTplRecords, OrdersNothingWithoutTheTable)
{
    LoadedTemplate loaded(templateOf("<Tables><Table><Name>X</Name></Table><Table><Use>D</Use></Table></Tables>"));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_FALSE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("Y"), ORDER_EASTING_NORTHING));
    EXPECT_FALSE(loaded.tpl.SetNorthEastTableFieldOrder(QString(), ORDER_EASTING_NORTHING));
    EXPECT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_EASTING_NORTHING)) << "no fields";
    UXmlReportTpl empty;
    EXPECT_FALSE(empty.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_EASTING_NORTHING));
}

} // namespace
