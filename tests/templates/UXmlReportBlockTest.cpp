#include "UXmlReportBlock.h"
#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateMarkup.h"

#include <gtest/gtest.h>

using markup::element;
using markup::field;
using markup::output;

namespace
{

const QByteArray content = element(
    "ReportTemplate",
    element("Name", "T") +
        element("Blocks", output("Block", "Site", "d",
                                 {field("A", "fourteen chars", "10.3"), field("B", "b", "6", "RIGHT"),
                                  field("A", "c", "4", "CENTER")}) +
                              output("Block", "NoDictionary", "Missing", {field("A", "a", "1")}) +
                              output("Block", "NoUse", "", {field("A", "a", "1")}) + output("Block", "Bare", "D", {})) +
        "<Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList><Variable><ID>4</ID>"
        "<VariableName>A</VariableName><Type>TEXT</Type></Variable></VariableList></Dictionary></Dictionaries>");

TEST(UXmlReportBlock, GivesItsFieldsAndEmptyOnesOutside)
{
    const LoadedTemplate loaded(content);
    ASSERT_TRUE(loaded.loaded);
    UXmlReportBlock block;
    EXPECT_EQ(block.GetFieldsCount(), 0);
    EXPECT_EQ(block.GetField(0).Label, QString());
    ASSERT_TRUE(block.LoadBlock(QStringLiteral("SITE"), &loaded.tpl));
    ASSERT_EQ(block.GetFieldsCount(), 3);
    EXPECT_EQ(block.GetField(0).Label, QStringLiteral("fourteen chars"));
    EXPECT_EQ(block.GetField(0).Width, 10) << "a block's label does not widen its field";
    EXPECT_EQ(block.GetField(0).Decimals, 3);
    EXPECT_EQ(block.GetField(0).Align, QStringLiteral("L"));
    EXPECT_EQ(block.GetField(0).ID, 4);
    EXPECT_EQ(block.GetField(1).Align, QStringLiteral("R"));
    EXPECT_EQ(block.GetField(1).ID, 4) << "a variable that the dictionary lacks: the one before it";
    EXPECT_EQ(block.GetField(2).Align, QStringLiteral("L")) << "a block is never centred";
    for (const int outside : {-1, 3, 1000}) {
        const sXmlReportField none = block.GetField(outside);
        EXPECT_EQ(none.VariableName + none.Label + none.Align, QString()) << outside;
        EXPECT_EQ(none.Width, 0) << outside;
        EXPECT_EQ(none.Decimals, 0) << outside;
        EXPECT_EQ(none.ID, 0) << outside;
        EXPECT_EQ(none.Type, 0) << outside;
    }
}

TEST(UXmlReportBlock, LoadsABlockWithoutFields)
{
    const LoadedTemplate loaded(content);
    UXmlReportBlock block;
    EXPECT_TRUE(block.LoadBlock(QStringLiteral("Bare"), &loaded.tpl));
    EXPECT_EQ(block.GetFieldsCount(), 0);
}

TEST(UXmlReportBlock, FailsAndPointsToNothing)
{
    const LoadedTemplate loaded(content);
    const struct
    {
        const char *name;
        const UXmlReportTpl *tpl;
        const char *reason;
    } rows[] = {
        {"Site", nullptr, "no template"},
        {"Place", &loaded.tpl, "no such block"},
        {"", &loaded.tpl, "no name"},
        {"NoDictionary", &loaded.tpl, "the dictionary is missing"},
        {"NoUse", &loaded.tpl, "no dictionary is named"},
    };
    for (const auto &row : rows) {
        UXmlReportBlock block;
        ASSERT_TRUE(block.LoadBlock(QStringLiteral("Site"), &loaded.tpl));
        EXPECT_FALSE(block.LoadBlock(QString::fromLatin1(row.name), row.tpl)) << row.reason;
        EXPECT_EQ(block.GetFieldsCount(), 0) << row.reason;
        EXPECT_EQ(block.GetField(0).Label, QString()) << row.reason;
    }
}

TEST(UXmlReportBlock, CopiesPointToTheSameRecords)
{
    const LoadedTemplate loaded(content);
    UXmlReportBlock block;
    ASSERT_TRUE(block.LoadBlock(QStringLiteral("Site"), &loaded.tpl));
    UXmlReportBlock copy;
    copy = block;
    EXPECT_EQ(copy.GetFieldsCount(), 3);
    EXPECT_EQ(copy.GetField(1).Label, QStringLiteral("b"));
}

} // namespace
