#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateMarkup.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <gtest/gtest.h>

// The lists of a template: where they end, which of several records of one name counts, what surrounds them.

using markup::element;
using markup::field;
using markup::output;
using markup::variable;

namespace
{

QByteArray templateOf(const QByteArray &body)
{
    return element("ReportTemplate", element("Name", "T") + body);
}

QByteArray named(const char *kind, const char *name)
{
    return element(kind, element("Name", name));
}

QByteArray dictionary(const char *name, const QByteArray &variables)
{
    return element("Dictionary", element("DictionaryName", name) + element("VariableList", variables));
}

QByteArray dictionaryOfA(const char *name, int id)
{
    return dictionary(name, variable(id, "A", "TEXT"));
}

QString listed(void (UXmlReportTpl::*fill)(QStringList &) const, const UXmlReportTpl &tpl)
{
    QStringList names;
    (tpl.*fill)(names);
    return names.join(u' ');
}

TEST(UXmlReportTplLists, OfTwoDictionariesOfOneNameTheFirstIsFoundAndTheLastFillsTheFields)
{
    const LoadedTemplate loaded(templateOf(element("Tables", output("Table", "X", "D", {field("A", "a", "1")})) +
                                           element("Dictionaries", dictionaryOfA("D", 1) + dictionaryOfA("d", 9))));
    ASSERT_TRUE(loaded.loaded);
    for (const auto &name : {QStringLiteral("D"), QStringLiteral("d")}) {
        const sXmlReportDictionary *found = loaded.tpl.GetDictionary(name);
        ASSERT_NE(found, nullptr);
        EXPECT_EQ(found->DictionaryName, QStringLiteral("D"));
        ASSERT_EQ(found->Variables.size(), 1U);
        EXPECT_EQ(found->Variables[0].ID, 1);
    }
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("X"))->Fields.at(0).ID, 9);
}

TEST(UXmlReportTplLists, OfTwoBlocksOfOneNameTheFirstIsFound)
{
    const LoadedTemplate loaded(
        templateOf(element("Blocks", output("Block", "B", "1", {}) + output("Block", "b", "2", {}))));
    ASSERT_NE(loaded.tpl.GetBlock(QStringLiteral("b")), nullptr);
    EXPECT_EQ(loaded.tpl.GetBlock(QStringLiteral("b"))->Use, QStringLiteral("1"));
}

TEST(UXmlReportTplLists, OfTwoSortListsOfOneNameTheFirstIsFound)
{
    const LoadedTemplate loaded(
        templateOf(element("Tables", output("Table", "X", "D", {}) + output("Table", "x", "D", {}, {"A"}) +
                                         output("Table", "X", "D", {}, {"A", "A"})) +
                   element("Dictionaries", dictionaryOfA("D", 1))));
    const sXmlSortTableReport *list = loaded.tpl.GetSortList(QStringLiteral("X"));
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->Name, QStringLiteral("x")) << "the first table of the name has no keys, so it has no list";
    EXPECT_EQ(list->Entries.size(), 1U);
}

TEST(UXmlReportTplLists, SortIdentifiersHaveNoSign)
{
    const LoadedTemplate loaded(
        templateOf(element("Tables", output("Table", "X", "D", {}, {"A", "B"})) +
                   element("Dictionaries", dictionary("D", variable(-6, "A", "TEXT") + variable(6, "B", "TEXT")))));
    UXmlReportTable table;
    ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
    std::vector<quint32> ids;
    table.GetSortList(ids);
    EXPECT_EQ(ids, (std::vector<quint32>{4294967290U, 6U}));
}

TEST(UXmlReportTplLists, TextOutsideTheTemplatesIsSkipped)
{
    const LoadedTemplate loaded("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\r\n"
                                "<!-- the office's templates & more > less -->\r\n"
                                "<Templates>\r\n\t<ReportTemplate><Name>First</Name></ReportTemplate>\r\n"
                                "\tbetween\r\n\t<ReportTemplate><Name>T</Name><Title>Second</Title></ReportTemplate>"
                                "\r\n</Templates>\r\n<!-- end -->");
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllTPLsByName, loaded.tpl), QStringLiteral("First T"));
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllTPLsByTitle, loaded.tpl), QStringLiteral(" Second"));
    EXPECT_EQ(loaded.tpl.GetTemplateTitle(), QStringLiteral("Second"));
}

TEST(UXmlReportTplLists, AnEmptyTemplateTableBlockOrDictionaryEndsItsList)
{
    const QByteArray emptyTemplate =
        templateOf({}) + "<ReportTemplate></ReportTemplate>" + named("ReportTemplate", "U");
    const LoadedTemplate templates(emptyTemplate);
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllTPLsByName, templates.tpl), QStringLiteral("T"));
    EXPECT_FALSE(LoadedTemplate(emptyTemplate, QStringLiteral("U")).loaded) << "it comes after the empty one";

    const LoadedTemplate loaded(templateOf(
        element("Tables", named("Table", "A") + "<Table></Table>" + named("Table", "B")) +
        element("Dictionaries", dictionaryOfA("C", 1) + "<Dictionary></Dictionary>" + dictionaryOfA("D", 2)) +
        element("Blocks", named("Block", "E") + "<Block></Block>" + named("Block", "F"))));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllTables, loaded.tpl), QStringLiteral("A"));
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllDictionaries, loaded.tpl), QStringLiteral("C"));
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllBlocks, loaded.tpl), QStringLiteral("E"));
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("B")), nullptr);
    EXPECT_EQ(loaded.tpl.GetDictionary(QStringLiteral("D")), nullptr);
    EXPECT_EQ(loaded.tpl.GetBlock(QStringLiteral("F")), nullptr);
}

TEST(UXmlReportTplLists, AnEmptyVariableFieldOrSortKeyEndsItsList)
{
    const std::vector<QByteArray> fields = {field("A", "a", "1"), "<Field></Field>", field("B", "b", "1")};
    const QByteArray variables = variable(1, "A", "TEXT") + "<Variable></Variable>" + variable(2, "B", "TEXT");
    const LoadedTemplate loaded(templateOf(element("Tables", output("Table", "X", "D", fields, {"A", "", "B"})) +
                                           element("Dictionaries", dictionary("D", variables)) +
                                           element("Blocks", output("Block", "Y", "D", fields))));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportFields &columns = loaded.tpl.GetTable(QStringLiteral("X"))->Fields;
    ASSERT_EQ(columns.size(), 1U);
    EXPECT_EQ(columns[0].VariableName, QStringLiteral("A"));
    const sXmlReportFields &lines = loaded.tpl.GetBlock(QStringLiteral("Y"))->Fields;
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(lines[0].VariableName, QStringLiteral("A"));
    const auto &known = loaded.tpl.GetDictionary(QStringLiteral("D"))->Variables;
    ASSERT_EQ(known.size(), 1U);
    EXPECT_EQ(known[0].VariableName, QStringLiteral("A"));
    const sXmlSortTableReport *sort = loaded.tpl.GetSortList(QStringLiteral("X"));
    ASSERT_NE(sort, nullptr);
    ASSERT_EQ(sort->Entries.size(), 1U);
    EXPECT_EQ(sort->Entries[0].VariableName, QStringLiteral("A"));
}

TEST(UXmlReportTplLists, ATableOfABlankDoesNotEndTheList)
{
    const LoadedTemplate loaded(
        templateOf(element("Tables", named("Table", "A") + "<Table> </Table>" + named("Table", "B"))));
    EXPECT_EQ(listed(&UXmlReportTpl::GetAllTables, loaded.tpl), QStringLiteral("A  B"));
}

TEST(UXmlReportTplLists, ATableWithoutUseMeetsADictionaryWithoutANameButCannotBeLoaded)
{
    const QByteArray list = element("VariableList", variable(7, "A", "LENGTH"));
    for (const QByteArray &name : {QByteArray(), element("DictionaryName", {})}) {
        const LoadedTemplate loaded(templateOf(element("Tables", output("Table", "X", "", {field("A", "a", "1")})) +
                                               element("Dictionaries", element("Dictionary", name + list)) +
                                               element("Blocks", output("Block", "Y", "", {field("A", "a", "1")}))));
        ASSERT_TRUE(loaded.loaded);
        for (const sXmlReportField &read : {loaded.tpl.GetTable(QStringLiteral("X"))->Fields.at(0),
                                            loaded.tpl.GetBlock(QStringLiteral("Y"))->Fields.at(0)})
        {
            EXPECT_EQ(read.ID, 7);
            EXPECT_EQ(read.Type, 6);
        }
        UXmlReportTable table;
        EXPECT_FALSE(table.LoadTable(QStringLiteral("X"), &loaded.tpl)) << "an empty name finds no dictionary";
        EXPECT_EQ(table.GetFieldsCount(), 0);
        UXmlReportBlock block;
        EXPECT_FALSE(block.LoadBlock(QStringLiteral("Y"), &loaded.tpl)) << "an empty name finds no dictionary";
        EXPECT_EQ(block.GetFieldsCount(), 0);
    }
}

TEST(UXmlReportTplLists, Format10Point3WithALabelOf14CharactersIsWidenedInATableOnly)
{
    const std::vector<QByteArray> fields = {field("A", "fourteen chars", "10.3")};
    const LoadedTemplate loaded(templateOf(element("Tables", output("Table", "X", "D", fields)) +
                                           element("Dictionaries", dictionaryOfA("D", 1)) +
                                           element("Blocks", output("Block", "Y", "D", fields))));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportField column = loaded.tpl.GetTable(QStringLiteral("X"))->Fields.at(0);
    EXPECT_EQ(column.Width, 14);
    EXPECT_EQ(column.Decimals, 3);
    const sXmlReportField line = loaded.tpl.GetBlock(QStringLiteral("Y"))->Fields.at(0);
    EXPECT_EQ(line.Width, 10);
    EXPECT_EQ(line.Decimals, 3);
}

TEST(UXmlReportTplLists, FlagWithoutAFormatIsOneWideOrAsWideAsItsLabel)
{
    const QByteArray bare = "<Field><VariableName>FLAG</VariableName></Field>";
    const QByteArray empty = "<Field><VariableName>Flag</VariableName><Format></Format></Field>";
    const QByteArray labelled = "<Field><VariableName>flag</VariableName><Label>Done</Label></Field>";
    const QByteArray wide = "<Field><VariableName>FLAG</VariableName><Format>3</Format></Field>";
    const std::vector<QByteArray> fields = {bare, empty, labelled, wide};
    const LoadedTemplate loaded(templateOf(element("Tables", output("Table", "X", "D", fields)) +
                                           element("Blocks", output("Block", "Y", "D", fields))));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportFields &columns = loaded.tpl.GetTable(QStringLiteral("X"))->Fields;
    const sXmlReportFields &lines = loaded.tpl.GetBlock(QStringLiteral("Y"))->Fields;
    constexpr int tableWidths[] = {1, 1, 4, 3};
    constexpr int blockWidths[] = {0, 0, 0, 3};
    ASSERT_EQ(columns.size(), 4U);
    ASSERT_EQ(lines.size(), 4U);
    for (std::size_t i = 0; i < 4; ++i) {
        EXPECT_EQ(columns[i].Width, tableWidths[i]) << i;
        EXPECT_EQ(lines[i].Width, blockWidths[i]) << i << ": the rule is for tables";
    }
}

} // namespace
