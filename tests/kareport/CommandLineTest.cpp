#include "CommandLine.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

TEST(CommandLine, SetReachesEveryKeyOfTheJob)
{
    struct Row
    {
        std::vector<const char *> sets;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {{"settings.lengthUnit=ft"},
         "\xC3\xA4\nPt   |    North\n\n1    |   41.010\n2A   |    0.000\n",
         "12.5 m in feet"},
        {{"options.separator=;"}, "\xC3\xA4\nPt   ;    North\n\n1    ;   12.500\n2A   ;    0.000\n", "a text"},
        {{"options.separator=59"}, "\xC3\xA4\nPt   ;    North\n\n1    ;   12.500\n2A   ;    0.000\n", "a number"},
        {{"options.zeroBlank=true"}, "\xC3\xA4\nPt   |    North\n\n1    |   12.500\n2A   |         \n", "a boolean"},
        {{"report.0.line=5"},
         "5\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n",
         "a text that looks like a number"},
        {{"report.0.line=a=b"}, "a=b\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n", "an equals sign inside"},
        {{"report.1.headingAfter=1"},
         "\xC3\xA4\nPt   |    North\n1    |   12.500\n2A   |    0.000\n",
         "an element's key"},
        {{"report=[{\"line\": \"x\"}]"}, "x\n", "a whole list"},
        {{"report=[{\"line\": \"x\"}]", "report.0.line=y"}, "y\n", "one after the other"},
        {{"settings.lengthUnit=ft", "settings.lengthDecimals=0"},
         "\xC3\xA4\nPt   |    North\n\n1    |       41\n2A   |        0\n",
         "several"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        QStringList arguments = words("render job.json");
        for (const char *set : row.sets) {
            arguments << QStringLiteral("--set") << QString::fromUtf8(set);
        }
        const ProgramRun run = folder.run(arguments);
        EXPECT_EQ(run.status, 0) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, row.expected) << row.reason;
    }
}

TEST(CommandLine, AWrongSetNamesTheOption)
{
    struct Row
    {
        const char *set;
        int status;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"settings.lengthUnit", 1, "KEY=VALUE", "no value"},
        {"=5", 1, "KEY=VALUE", "no key"},
        {"title.x=5", 1, "\"title.x\"", "inside what is not an object"},
        {"report.9.line=5", 1, "\"report.9.line\"", "beyond the last step"},
        {"settings.lengthUnit=yd", 2, "--set settings.lengthUnit=yd: error: one of m, mm, km, ft, usft",
         "a wrong value"},
        {"settings.length=m", 2, "unknown key \"length\"", "an unknown key"},
        {"page.linesPerPage=0", 2, "--set page.linesPerPage=0: error: a whole number from 1", "a number out of range"},
        {"data.p.csv=none.csv", 2, "none.csv", "a missing file"},
    };
    for (const Row &row : rows) {
        CommandLineFolder folder;
        folder.put("job.json", folder.bytesOf("job.json").replace("{\"header\"", "{\"title\": \"T\", \"header\""));
        const ProgramRun run = folder.run(words("render job.json -o out.txt --set") << QString::fromUtf8(row.set));
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.contains)) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.reason;
        EXPECT_FALSE(QFile::exists(folder.path("out.txt"))) << row.reason;
    }
}

TEST(CommandLine, TheShortFormNeedsNoJobFile)
{
    const CommandLineFolder folder;
    const ProgramRun table =
        folder.run("render --template t.xml --name CONTROL --table Points --data points.csv -o - --set header=false "
                   "--set page.linesPerPage=72 --set page.charsPerRow=80");
    EXPECT_EQ(table.status, 0) << table.all().constData();
    EXPECT_TRUE(table.out.endsWith("1    |   12.500\n2A   |    0.000\n")) << table.out.constData();
    const ProgramRun block = folder.run("render -t t.xml -n control --block Point -d points.csv -o block.txt "
                                        "--set header=false");
    EXPECT_EQ(block.status, 0) << block.all().constData();
    EXPECT_EQ(block.out, "");
    EXPECT_EQ(folder.bytesOf("block.txt"), "Pt|1\n");
    const ProgramRun printed =
        folder.run("render -t t.xml -n CONTROL --table Points -d points.csv --set now=2024-03-05T14:07:00 "
                   "--set page.linesPerPage=72 --set page.charsPerRow=80");
    EXPECT_TRUE(printed.out.startsWith("TALVEN - Control points ")) << "a header, the template's title, text";
    EXPECT_TRUE(printed.out.contains("Mar 05, 2024  02:07PM")) << printed.out.constData();
}

TEST(CommandLine, AWrongCommandLineIsStatus1)
{
    struct Row
    {
        const char *line;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "no command"},
        {"print job.json", "no such command"},
        {"render", "nothing to render"},
        {"render job.json --colour", "no such option"},
        {"render job.json -o", "no file name"},
        {"render job.json --as doc", "no such kind"},
        {"render job.json --as", "no kind"},
        {"render job.json -o a.doc", "an ending of no kind"},
        {"render job.json -o a", "no ending"},
        {"render job.json --template t.xml", "a job and the short form"},
        {"render --template t.xml", "half of the short form"},
        {"render --template t.xml --name CONTROL --table Points", "the short form without data"},
        {"render --template t.xml --name CONTROL --data points.csv", "neither table nor block"},
        {"render --template t.xml --name CONTROL --table Points --block Point --data points.csv", "table and block"},
        {"render --template t.xml --table Points --data points.csv", "no name"},
        {"render --name CONTROL --table Points --data points.csv", "no template"},
        {"templates", "no file"},
        {"templates t.xml u.xml", "two files"},
        {"check", "no file"},
        {"--colour", "no such option"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 1) << row.line << ": " << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.line;
        EXPECT_NE(run.err, "") << row.line;
        EXPECT_EQ(folder.names(), words("job.json points.csv t.xml")) << row.line;
    }
}

TEST(CommandLine, HelpAndVersionGoToStandardOutput)
{
    const CommandLineFolder folder;
    const ProgramRun version = folder.run("--version");
    EXPECT_EQ(version.status, 0);
    EXPECT_TRUE(version.out.startsWith("kareport ")) << version.out.constData();
    EXPECT_EQ(version.err, "");
    struct Row
    {
        const char *line;
        std::vector<const char *> contains;
    };
    const Row rows[] = {
        {"--help", {"render", "templates", "check", "Exit status"}},
        {"render --help",
         {"--output", "--as", "--set", "--template", "--name", "--table", "--block", "--data", "--progress", "--quiet",
          "--jobs", "--slice", "--update"}},
        {"templates --help", {"--name", "--json"}},
        {"check --help", {"FILE"}},
    };
    for (const Row &row : rows) {
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 0) << row.line;
        EXPECT_EQ(run.err, "") << row.line;
        for (const char *text : row.contains) {
            EXPECT_TRUE(run.out.contains(text)) << row.line << ": " << text << "\n" << run.out.constData();
        }
    }
}

TEST(CommandLine, ProgressAndRemarksGoToStandardError)
{
    const CommandLineFolder folder;
    const ProgramRun progress = folder.run("render job.json --progress -o -");
    EXPECT_EQ(progress.status, 0);
    EXPECT_EQ(progress.out, jobText());
    EXPECT_TRUE(progress.err.contains("points.csv")) << progress.err.constData();
    const ProgramRun both = folder.run("render job.json --progress --quiet -o a.txt");
    EXPECT_EQ(both.status, 0);
    EXPECT_EQ(both.out, "");
    EXPECT_EQ(folder.bytesOf("a.txt"), jobText());
}

TEST(CommandLine, ReportsAreTheSameInEveryTimeZoneAndLanguage)
{
    const CommandLineFolder folder;
    const QStringList arguments = words("render job.json --set header=true");
    const ProgramRun first =
        runProgram(folder.path(), arguments, {{"SOURCE_DATE_EPOCH", "1709647620"}, {"TZ", "UTC"}, {"LC_ALL", "C"}});
    EXPECT_TRUE(first.out.contains("Mar 05, 2024  02:07PM")) << first.all().constData();
    for (const auto &[zone, language] : {std::pair{"Asia/Tokyo", "de_DE.UTF-8"}, {"EST5EDT", "C.UTF-8"}}) {
        const ProgramRun run = runProgram(folder.path(), arguments,
                                          {{"SOURCE_DATE_EPOCH", "1709647620"}, {"TZ", zone}, {"LC_ALL", language}});
        EXPECT_EQ(run.status, 0) << zone;
        EXPECT_EQ(run.out, first.out) << zone;
    }
    const ProgramRun fixed = runProgram(folder.path(), arguments + words("--set now=2020-01-02T03:04:05"),
                                        {{"SOURCE_DATE_EPOCH", "1709647620"}, {"TZ", "Asia/Tokyo"}});
    EXPECT_TRUE(fixed.out.contains("Jan 02, 2020  03:04AM")) << "the job's own time wins";
}

} // namespace
