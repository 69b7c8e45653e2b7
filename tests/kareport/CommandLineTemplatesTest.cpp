#include "CommandLine.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>

#include <gtest/gtest.h>

namespace
{

TEST(CommandLineTemplates, ListsNamesAndTitlesWithATabBetween)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("templates t.xml");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, "CONTROL\tControl points\nSITE\tSite \xC3\xA4\n");
    EXPECT_EQ(run.err, "");
}

TEST(CommandLineTemplates, ListsThemForPrograms)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("templates t.xml --json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    const QJsonArray list = QJsonDocument::fromJson(run.out).array();
    ASSERT_EQ(list.size(), 2) << run.out.constData();
    EXPECT_EQ(list[0].toObject()[u"name"].toString(), QStringLiteral("CONTROL"));
    EXPECT_EQ(list[0].toObject()[u"title"].toString(), QStringLiteral("Control points"));
    EXPECT_EQ(list[1].toObject()[u"name"].toString(), QStringLiteral("SITE"));
    EXPECT_EQ(list[1].toObject()[u"title"].toString(), QString::fromUtf8("Site \xC3\xA4"));
}

TEST(CommandLineTemplates, ShowsOneTemplate)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("templates t.xml --name CONTROL");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    for (const char *part : {"Control points", "table Points", "block Point", "dictionary Survey", "Number", "Northing",
                             "NUMBER", "COORDINATE", "separator 124"})
    {
        EXPECT_TRUE(run.out.contains(part)) << part << "\n" << run.out.constData();
    }
    EXPECT_FALSE(run.out.contains("SITE"));
}

TEST(CommandLineTemplates, ShowsOneTemplateForPrograms)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("templates t.xml --name CONTROL --json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    const QJsonObject shown = QJsonDocument::fromJson(run.out).object();
    EXPECT_EQ(shown[u"title"].toString(), QStringLiteral("Control points"));
    EXPECT_EQ(shown[u"separator"].toInt(), 124);
    const QJsonObject table = shown[u"tables"].toArray()[0].toObject();
    EXPECT_EQ(table[u"name"].toString(), QStringLiteral("Points"));
    EXPECT_EQ(table[u"dictionary"].toString(), QStringLiteral("Survey"));
    ASSERT_EQ(table[u"fields"].toArray().size(), 2) << run.out.constData();
    const QJsonObject field = table[u"fields"].toArray()[1].toObject();
    EXPECT_EQ(field[u"variable"].toString(), QStringLiteral("Northing"));
    EXPECT_EQ(field[u"label"].toString(), QStringLiteral("North"));
    EXPECT_EQ(field[u"width"].toInt(), 9);
    EXPECT_EQ(field[u"decimals"].toInt(), 3);
    EXPECT_EQ(field[u"align"].toString(), QStringLiteral("R"));
    EXPECT_EQ(field[u"type"].toString(), QStringLiteral("COORDINATE"));
    EXPECT_EQ(shown[u"blocks"].toArray()[0].toObject()[u"name"].toString(), QStringLiteral("Point"));
    const QJsonObject dictionary = shown[u"dictionaries"].toArray()[0].toObject();
    EXPECT_EQ(dictionary[u"name"].toString(), QStringLiteral("Survey"));
    EXPECT_EQ(dictionary[u"variables"].toArray().size(), 2);
}

TEST(CommandLineTemplates, WhatCannotBeListedIsStatus2)
{
    struct Row
    {
        const char *line;
        QByteArray content;
        const char *begins;
        const char *contains;
        const char *reason;
    };
    const QByteArray whole = controlTemplates();
    const Row rows[] = {
        {"templates none.xml", whole, "none.xml", "cannot be read", "a missing file"},
        {"templates t.xml", "", "t.xml:1:1: error: ", "ReportTemplate", "an empty file"},
        {"templates t.xml", QByteArray(5000, '\0'), "t.xml:1:1: error: ", "ReportTemplate", "zero bytes"},
        {"templates t.xml", "text", "t.xml:1:1: error: ", "ReportTemplate", "no markup"},
        {"templates t.xml", whole.first(400), "t.xml:2:1: error: ", "closing tag", "cut off in the middle"},
        {"templates t.xml --name NONE", whole, "t.xml:", "CONTROL, SITE", "no template of that name"},
        {"templates t.xml --name NONE --json", whole, "t.xml:", "CONTROL, SITE", "the same for programs"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("t.xml", row.content);
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 2) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.err.count('\n'), 1) << row.reason << "\n" << run.err.constData();
        EXPECT_TRUE(run.err.startsWith(row.begins)) << row.reason << "\n" << run.err.constData();
        EXPECT_TRUE(run.err.contains(row.contains)) << row.reason << "\n" << run.err.constData();
    }
}

/// Every line of the check's output is file:line:column: warning|error: text.
void expectCheckLines(const QByteArray &out)
{
    static const QRegularExpression form(QStringLiteral(R"(\At\.xml:[1-9]\d*:[1-9]\d*: (warning|error): \S.*\z)"));
    EXPECT_TRUE(out.isEmpty() || out.endsWith('\n')) << out.constData();
    for (const QByteArray &line : out.split('\n')) {
        EXPECT_TRUE(line.isEmpty() || form.match(QString::fromUtf8(line)).hasMatch()) << line.constData();
    }
}

TEST(CommandLineCheck, SaysNothingOfAGoodFile)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("check t.xml");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, "");
    EXPECT_EQ(run.err, "");
}

TEST(CommandLineCheck, SaysWhatIsIgnoredInSilence)
{
    struct Row
    {
        const char *before;
        const char *after;
        const char *remark; ///< begins a line of the output, with the place and what it is
        int status;         ///< -1 for either
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<Label>Pt</Label>", "<Label >Pt</Label>", "t.xml:5:43: error: ", 2, "a tag with a blank"},
        {"<Tables>", "<Tables id=\"1\">", "t.xml:4:1: error: ", 2, "a tag with an attribute"},
        {"<Title>Control points</Title>", "<Title>Control <Title>all</Title> points</Title>", "t.xml:3:", -1,
         "an element that is cut short at the first closing tag"},
        {"<OutputList>\n<Field>", "<OutputList>\n<Field></Field><Field>", "t.xml:5:1: error: ", 2,
         "an empty element that ends its list"},
        {"<ReportTemplate><Name>SITE", "<ReportTemplate><Tables></Tables><Name>SITE", "t.xml:17:34: error: ", 2,
         "a name after the tables"},
        {"<Name>CONTROL</Name><Title>Control points</Title>\n", "\n", "t.xml:", 2, "no name of its own"},
        {"<Type>COORDINATE</Type>", "<Type>COORD</Type>", "t.xml:10:58: error: ", 2, "an unknown type"},
        {"<VariableName>Northing</VariableName><Label>", "<VariableName>Height</VariableName><Label>",
         "t.xml:6:8: error: ", 2, "a variable that the dictionary lacks"},
        {"<Use>Survey</Use><Sort>", "<Use>Site</Use><Sort>", "t.xml:4:35: error: ", 2,
         "a table whose dictionary is missing"},
        {"<Label>Pt</Label><Format>5</Format>", "<Label>Point no.</Label><Format>5</Format>",
         "t.xml:5:43: warning: ", 0, "a label wider than its column"},
        {"<Separator>124</Separator>", "", "t.xml:", -1, "a missing separator"},
        {"<Name>SITE</Name>", "<Name>control</Name>", "t.xml:17:17: warning: ", 0, "two templates of one name"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        QByteArray content = controlTemplates();
        ASSERT_TRUE(content.contains(row.before)) << row.reason;
        const qsizetype at = content.indexOf(row.before);
        content.replace(at, qsizetype(qstrlen(row.before)), row.after);
        folder.put("t.xml", content);
        const ProgramRun run = folder.run("check t.xml");
        expectCheckLines(run.out);
        EXPECT_TRUE(('\n' + run.out).contains(QByteArray("\n") + row.remark)) << row.reason << "\n"
                                                                              << run.all().constData();
        EXPECT_EQ(run.status, run.out.contains(": error: ") ? 2 : 0) << row.reason << ": 2 with errors only";
        if (row.status >= 0) {
            EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        }
        EXPECT_EQ(run.err, "") << row.reason;
    }
}

TEST(CommandLineCheck, AFileThatIsNotATemplateIsStatus2)
{
    for (const QByteArray &content :
         {QByteArray(), QByteArray(5000, '\0'), QByteArray("text"), QByteArray("\xFF\xFE<")}) {
        const CommandLineFolder folder;
        folder.put("t.xml", content);
        const ProgramRun run = folder.run("check t.xml");
        EXPECT_EQ(run.status, 2) << run.all().constData();
        expectCheckLines(run.out);
        EXPECT_TRUE(run.out.startsWith("t.xml:1:1: error: ")) << run.all().constData();
    }
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("check none.xml");
    EXPECT_EQ(run.status, 2);
    EXPECT_TRUE((run.out + run.err).startsWith("none.xml")) << run.all().constData();
}

} // namespace
