#include "CommandLine.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

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

} // namespace
