#include "CommandLine.h"

#include <QFile>

#include <gtest/gtest.h>

// A report that becomes one file of text is written there while it is made. Nothing of that may show except its speed.

namespace
{

QByteArray manyPoints(int rows, const QByteArray &last = QByteArray())
{
    QByteArray csv = "Number,Northing\n";
    for (int i = 0; i < rows; ++i) {
        csv += QByteArray::number(i) + ',' + QByteArray::number(i * 0.25, 'f', 3) + '\n';
    }
    return csv + last;
}

/// The job of the folder with its steps and outputs replaced.
QByteArray jobWith(const char *steps, const char *outputs)
{
    return QByteArray("{\"now\": \"2024-03-05T14:07:00\", \"page\": {\"linesPerPage\": 72, \"charsPerRow\": 80},\n"
                      " \"template\": {\"file\": \"t.xml\", \"name\": \"CONTROL\"},\n"
                      " \"data\": {\"p\": {\"csv\": \"points.csv\"}},\n"
                      " \"report\": [") +
           steps + "], \"output\": [" + outputs + "]}";
}

constexpr const char *table = R"({"line": "before"}, {"table": "Points", "data": "p"}, {"line": "äöü"})";

TEST(CommandLineStream, TheFileIsTheOneThatIsWrittenAtTheEnd)
{
    struct Row
    {
        const char *steps;
        int rows;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"line": "x"})", 1, "less than is handed on at a time"},
        {table, 30'000, "several pieces"},
        {R"({"table": "Points", "data": "p"}, {"clear": true}, {"line": "after"})", 30'000,
         "a report that is emptied on the way"},
        {R"({"newPage": -1}, {"table": "Points", "data": "p"}, {"heading": "漢"}, {"newPage": -1})", 10'000, "pages"},
        {R"({"table": "Points", "data": "p"}, {"table": "Points", "data": "p"})", 9'000, "two tables"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("points.csv", manyPoints(row.rows));
        // Two outputs need the whole report; one of them alone does not.
        folder.put("both.json", jobWith(row.steps, R"("both.rep", "both.txt")"));
        folder.put("rep.json", jobWith(row.steps, R"("one.rep")"));
        folder.put("txt.json", jobWith(row.steps, R"("one.txt")"));
        for (const char *line : {"render both.json", "render rep.json", "render txt.json"}) {
            const ProgramRun run = folder.run(line);
            EXPECT_EQ(run.status, 0) << row.reason << "\n" << run.all().constData();
            EXPECT_EQ(run.err, "") << row.reason;
        }
        EXPECT_EQ(folder.bytesOf("one.rep"), folder.bytesOf("both.rep")) << row.reason;
        EXPECT_EQ(folder.bytesOf("one.txt"), folder.bytesOf("both.txt")) << row.reason;
    }
}

TEST(CommandLineStream, AMistakeInTheLastRowLeavesTheOldFile)
{
    for (const char *output : {"out.rep", "out.txt"}) {
        const CommandLineFolder folder;
        folder.put("points.csv", manyPoints(40'000, "7,seven\n"));
        folder.put("job.json", jobWith(table, QByteArray('"' + QByteArray(output) + '"').constData()));
        folder.put(output, "kept");
        const ProgramRun run = folder.run("render job.json");
        EXPECT_EQ(run.status, 2) << run.all().constData();
        EXPECT_TRUE(run.err.contains("points.csv:40002:3: error: ")) << run.err.constData();
        EXPECT_EQ(folder.bytesOf(output), "kept");
        EXPECT_EQ(folder.names(), words("job.json") << QString::fromUtf8(output) << words("points.csv t.xml"))
            << "no half-written file stays beside it";
    }
}

TEST(CommandLineStream, WhatIsWrongWithTheInputIsSaidBeforeTheOutput)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Northing\n1,x\n");
    folder.put("job.json", jobWith(table, R"("missing-folder/out.rep")"));
    const ProgramRun both = folder.run("render job.json");
    EXPECT_EQ(both.status, 2) << both.all().constData();
    folder.put("points.csv", "Number,Northing\n1,2\n");
    const ProgramRun output = folder.run("render job.json");
    EXPECT_EQ(output.status, 3) << output.all().constData();
    EXPECT_TRUE(output.err.contains("\"") && output.err.contains("could not be written")) << output.err.constData();
}

TEST(CommandLineStream, AnEmptyReportMakesNoReportFile)
{
    const CommandLineFolder folder;
    folder.put("rep.json", R"({"header": false, "report": [], "output": ["out.rep"]})");
    folder.put("txt.json", R"({"header": false, "report": [], "output": ["out.txt"]})");
    folder.put("out.rep", "kept");
    const ProgramRun report = folder.run("render rep.json");
    EXPECT_EQ(report.status, 0) << report.all().constData();
    EXPECT_TRUE(report.err.contains("the report is empty: ")) << report.err.constData();
    EXPECT_EQ(folder.bytesOf("out.rep"), "kept");
    EXPECT_EQ(folder.run("render rep.json --quiet").err, "");
    EXPECT_EQ(folder.run("render txt.json").status, 0);
    EXPECT_EQ(folder.bytesOf("out.txt"), "") << "an empty text is one";
}

TEST(CommandLineStream, ALinkStaysALink)
{
    const CommandLineFolder folder;
    folder.put("target.txt", "old");
    ASSERT_TRUE(QFile::link(QStringLiteral("target.txt"), folder.path("out.txt")));
    folder.put("job.json", jobWith(table, R"("out.txt")"));
    EXPECT_EQ(folder.run("render job.json").status, 0);
    EXPECT_TRUE(QFileInfo(folder.path("out.txt")).isSymLink());
    EXPECT_TRUE(folder.bytesOf("target.txt").contains("before"));
}

} // namespace
