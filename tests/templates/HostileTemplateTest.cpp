#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateCheck.h"
#include "TemplateFile.h"
#include "TemplateNames.h"
#include "TestSize.h"

#include <gtest/gtest.h>

// Templates that a walk over the text for every element would take minutes for.

namespace
{

/// So many that a walk over the text for each would take minutes.
const int many = testSize(40'000, 100'000);

QByteArray templateOf(const QByteArray &body)
{
    return "<ReportTemplate><Name>T</Name><Title>Title</Title>" + body +
           "<Options><Separator>|</Separator></Options></ReportTemplate>";
}

QByteArray numbered(const char *before, int number, const char *after)
{
    return before + QByteArray::number(number) + after;
}

/// A table whose fields "V0", "V1" and so on end with the short closing tag and the five characters that go with it.
QByteArray tableOfShortFields(int count)
{
    QByteArray fields;
    for (int i = 0; i < count; ++i) {
        fields += numbered("<Field><VariableName>V", i, "</VariableName><Format>5</Format></>\n12345");
    }
    return "<Tables><Table><Name>X</Name><Use>D</Use><OutputList>" + fields + "</OutputList></Table></Tables>";
}

QByteArray dictionaryOf(int count)
{
    QByteArray variables;
    for (int i = 0; i < count; ++i) {
        variables += numbered("<Variable><ID>", i + 1, "</ID><VariableName>V") +
                     numbered("", i, "</VariableName><Type>LENGTH</Type></Variable>\n");
    }
    return "<Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>" + variables +
           "</VariableList></Dictionary></Dictionaries>";
}

TEST(HostileTemplate, ReadsManyFieldsWithShortClosingTags)
{
    const LoadedTemplate loaded(templateOf(tableOfShortFields(many)));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportTable *table = loaded.tpl.GetTable(QStringLiteral("X"));
    ASSERT_NE(table, nullptr);
    ASSERT_EQ(table->Fields.size(), std::size_t(many));
    for (int i = 0; i < many; i += 9999) {
        const sXmlReportField &field = table->Fields[static_cast<std::size_t>(i)];
        EXPECT_EQ(field.VariableName, u'V' + QString::number(i));
        EXPECT_EQ(field.Width, 5);
    }
}

TEST(HostileTemplate, JoinsManyFieldsWithManyVariables)
{
    const LoadedTemplate loaded(templateOf(tableOfShortFields(many) + dictionaryOf(many)));
    ASSERT_TRUE(loaded.loaded);
    ASSERT_EQ(loaded.tpl.GetDictionary(QStringLiteral("D"))->Variables.size(), std::size_t(many));
    const sXmlReportFields &fields = loaded.tpl.GetTable(QStringLiteral("X"))->Fields;
    ASSERT_EQ(fields.size(), std::size_t(many));
    for (int i = 0; i < many; ++i) {
        ASSERT_EQ(fields[static_cast<std::size_t>(i)].ID, i + 1);
        ASSERT_EQ(fields[static_cast<std::size_t>(i)].Type, 6);
    }
}

TEST(HostileTemplate, ReadsNothingAfterManyTagsThatAreNotClosed)
{
    for (const char *tag : {"<Field>", "<Table>", "<OutputList>", "<Name>", "<Tables>", "<Options>", "</", "<"}) {
        QByteArray tags;
        for (int i = 0; i < 10000; ++i) {
            tags += tag;
        }
        const LoadedTemplate loaded(
            templateOf("<Tables><Table><Name>X</Name><OutputList>" + tags + "</OutputList></Table></Tables>"));
        ASSERT_TRUE(loaded.loaded) << tag;
        QStringList tables;
        loaded.tpl.GetAllTables(tables);
        ASSERT_EQ(tables, QStringList(QStringLiteral("X"))) << tag;
        EXPECT_TRUE(loaded.tpl.GetTable(QStringLiteral("X"))->Fields.empty()) << tag;
    }
}

TEST(HostileTemplate, ReadsTheFirstOfManyTagsThatAreClosedOnce)
{
    QByteArray open;
    for (int i = 0; i < 10000; ++i) {
        open += "<Field>";
    }
    const LoadedTemplate loaded(templateOf("<Tables><Table><Name>X</Name><OutputList>" + open +
                                           "<VariableName>A</VariableName></Field></OutputList></Table></Tables>"));
    ASSERT_TRUE(loaded.loaded);
    ASSERT_EQ(loaded.tpl.GetTable(QStringLiteral("X"))->Fields.size(), 1U);
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("X"))->Fields[0].VariableName, QStringLiteral("A"));
}

TEST(HostileTemplate, TemplatesThatAreNotClosedAreNotRead)
{
    QByteArray open;
    for (int i = 0; i < 10000; ++i) {
        open += "<ReportTemplate><Name>T</Name>";
    }
    EXPECT_FALSE(LoadedTemplate(open).loaded);
    EXPECT_TRUE(LoadedTemplate(open + "</ReportTemplate>").loaded) << "the first one runs on to the end";
}

TEST(HostileTemplate, CutsThatJoinToTagsAgainAndAgain)
{
    // Each cut joins the "<" before it with what follows to the next opening tag.
    constexpr int depth = 20000;
    QByteArray list(depth, '<');
    list += "Field><VariableName>A</VariableName></Field>";
    for (int i = 1; i < depth; ++i) {
        list += "Field><VariableName>B</VariableName></Field>";
    }
    const LoadedTemplate loaded(
        templateOf("<Tables><Table><Name>X</Name><OutputList>" + list + "</OutputList></Table></Tables>"));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportFields &fields = loaded.tpl.GetTable(QStringLiteral("X"))->Fields;
    ASSERT_EQ(fields.size(), std::size_t(depth));
    EXPECT_EQ(fields.front().VariableName, QStringLiteral("A"));
    EXPECT_EQ(fields.back().VariableName, QStringLiteral("B"));
}

TEST(HostileTemplate, ReadsAValueOfAMegabyte)
{
    constexpr int megabyte = 1 << 20;
    for (const char fill : {'x', '<', '>', '/', '\n'}) {
        const LoadedTemplate loaded("<ReportTemplate><Name>T</Name><Title>" + QByteArray(megabyte, fill) +
                                    "</Title></ReportTemplate>");
        ASSERT_TRUE(loaded.loaded) << fill;
        const QString expected = fill == '\n' ? QString() : QString(megabyte, QLatin1Char(fill));
        EXPECT_TRUE(loaded.tpl.GetTemplateTitle() == expected) << fill;
    }
}

TEST(HostileTemplate, ReadsALabelOfAMegabyte)
{
    constexpr int megabyte = 1 << 20;
    const LoadedTemplate loaded(templateOf("<Tables><Table><Name>X</Name><OutputList><Field><Label>" +
                                           QByteArray(megabyte, 'x') +
                                           "</Label></Field></OutputList></Table></Tables>"));
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("X"))->Fields.at(0).Width, megabyte);
}

TEST(HostileTemplate, ReadsManyTemplates)
{
    QByteArray bytes;
    for (int i = 0; i < 20000; ++i) {
        bytes += numbered("<ReportTemplate><Name>T", i, "</Name></ReportTemplate>\r\n");
    }
    const LoadedTemplate loaded(bytes, QStringLiteral("t19999"));
    ASSERT_TRUE(loaded.loaded);
    QStringList names;
    loaded.tpl.GetAllTPLsByName(names);
    ASSERT_EQ(names.size(), 20000);
    EXPECT_EQ(names.last(), QStringLiteral("T19999"));
    EXPECT_TRUE(kareport::templateNames(kareport::TemplateFile(bytes)) == names);
}

TEST(HostileTemplate, ReadsManyTablesAndSortKeys)
{
    QByteArray tables;
    for (int i = 0; i < 20000; ++i) {
        tables +=
            numbered("<Table><Name>X", i, "</Name><Use>D</Use><Sort><VariableName>V0</VariableName></Sort></Table>");
    }
    const LoadedTemplate loaded(templateOf("<Tables>" + tables + "</Tables>" + dictionaryOf(1)));
    ASSERT_TRUE(loaded.loaded);
    const sXmlSortTableReport *list = loaded.tpl.GetSortList(QStringLiteral("x19999"));
    ASSERT_NE(list, nullptr);
    EXPECT_EQ(list->Entries.at(0).ID, 1U);
}

TEST(HostileTemplate, ChecksManyFieldsWithARemarkOnEach)
{
    const QByteArray bytes = templateOf(tableOfShortFields(many) + dictionaryOf(1));
    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(bytes));
    // All fields but the first lack their variable, and the characters after all of them are dropped.
    EXPECT_EQ(remarks.size(), std::size_t(2 * many - 1));
}

TEST(HostileTemplate, ChecksManyRemarksInOneLongLine)
{
    const int count = many;
    QByteArray bytes = templateOf(tableOfShortFields(count) + dictionaryOf(1));
    bytes.replace("\n", "");
    bytes.replace("<Title>Title", "<Title>\xF0\x9F\x98\x80"); // places are counted in characters
    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(bytes));
    ASSERT_EQ(remarks.size(), std::size_t(2 * count - 1));
    const QString text = QString::fromUtf8(bytes);
    const qsizetype last = text.lastIndexOf(QStringLiteral("12345"));
    EXPECT_EQ(remarks.back().place.line, 1);
    EXPECT_EQ(remarks.back().place.column, last - 1 + 1) << "the surrogate pair before it is one character";
}

TEST(HostileTemplate, ReadsAndChecksManyUsesOfADictionaryWithALongName)
{
    // Folding the name for every field or key, or naming it in every remark, would take gigabytes.
    constexpr int fieldCount = 10000;
    const QByteArray longName(200000, 'd');
    QByteArray fields;
    QByteArray keys;
    for (int i = 0; i < fieldCount; ++i) {
        fields += numbered("<Field><VariableName>V", i, "</VariableName><Format>5</Format></Field>\n");
        keys += numbered("<VariableName>V", i, "</VariableName>\n");
    }
    const QByteArray list = "<OutputList>" + fields + "</OutputList>";
    const QByteArray use = "<Name>X</Name><Use>" + longName.toUpper() + "</Use>";
    QByteArray dictionary = dictionaryOf(1);
    dictionary.replace("<DictionaryName>D<", "<DictionaryName>" + longName + "<");
    const QByteArray bytes =
        templateOf("<Tables><Table>" + use + "<Sort>" + keys + "</Sort>" + list + "</Table></Tables>" + dictionary +
                   "<Blocks><Block>" + use + list + "</Block></Blocks>");

    const LoadedTemplate loaded(bytes);
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportFields &columns = loaded.tpl.GetTable(QStringLiteral("X"))->Fields;
    const sXmlReportFields &lines = loaded.tpl.GetBlock(QStringLiteral("X"))->Fields;
    const auto &entries = loaded.tpl.GetSortList(QStringLiteral("X"))->Entries;
    ASSERT_EQ(columns.size(), std::size_t(fieldCount));
    ASSERT_EQ(lines.size(), std::size_t(fieldCount));
    ASSERT_EQ(entries.size(), std::size_t(fieldCount));
    EXPECT_EQ(columns.front().ID, 1);
    EXPECT_EQ(columns.back().ID, 0) << "the dictionary has the first variable only";
    EXPECT_EQ(lines.back().ID, 1) << "a block's lines take over the one before";
    EXPECT_EQ(entries.back().ID, 1U) << "so do sort keys";

    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(bytes));
    EXPECT_EQ(remarks.size(), std::size_t(3 * (fieldCount - 1))) << "each but the first variable, three times";
    qsizetype characters = 0;
    for (const auto &remark : remarks) {
        characters += remark.text.size();
    }
    EXPECT_LT(characters, 30000 * 200) << "long names are cut short";
}

TEST(HostileTemplate, ChecksManyTagsThatAreNotValid)
{
    QByteArray tags;
    for (int i = 0; i < 10000; ++i) {
        tags += "<Name >\n";
    }
    EXPECT_EQ(kareport::checkTemplates(kareport::TemplateFile(templateOf(tags))).size(), 10000U);
    EXPECT_EQ(kareport::checkTemplates(kareport::TemplateFile(templateOf(QByteArray(1 << 20, '<')))).size(), 1U)
        << "a text that is not read";
    QByteArray comments;
    for (int i = 0; i < 10000; ++i) {
        comments += "<!-- ";
    }
    EXPECT_EQ(kareport::checkTemplates(kareport::TemplateFile(templateOf(comments))).size(), 5U)
        << "the tags after the comments, which have no end";
}

} // namespace
