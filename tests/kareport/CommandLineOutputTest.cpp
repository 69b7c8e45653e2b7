#include "CommandLine.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

namespace
{

TEST(CommandLineOutput, WithoutAnyOutputTheReportGoesToStandardOutputAsText)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("render job.json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, jobText()) << "UTF-8, LF for line ends, and nothing else";
    EXPECT_EQ(run.err, "");
    EXPECT_EQ(folder.names(), words("job.json points.csv t.xml")) << "no file is written";
}

TEST(CommandLineOutput, OutputsAreWrittenByTheirEndings)
{
    struct Row
    {
        const char *line;
        QByteArray out;
        const char *file;
        QByteArray bytes;
        const char *reason;
    };
    const Row rows[] = {
        {"render job.json -o a.txt", "", "a.txt", jobText(), "text by its ending"},
        {"render job.json -o a.rep", "", "a.rep", jobReport(), "a report file by its ending"},
        {"render job.json -o a.REP", "", "a.REP", jobReport(), "in capitals"},
        {"render job.json --output=a.rep", "", "a.rep", jobReport(), "the long option"},
        {"render -o a.rep job.json", "", "a.rep", jobReport(), "the option in front"},
        {"render --set title=x job.json -o a.rep", "", "a.rep", jobReport(), "another option in front"},
        {"render job.json -o -", jobText(), nullptr, "", "standard output"},
        {"render job.json -o a.dat --as rep", "", "a.dat", jobReport(), "the kind is named"},
        {"render job.json -o a.dat --as text", "", "a.dat", jobText(), "the kind is named"},
        {"render job.json -o a --as=text", "", "a", jobText(), "no ending at all"},
        {"render job.json -o - -o a.rep -o b.txt", jobText(), "a.rep", jobReport(), "several outputs"},
        {"render job.json -o a.txt -o b.rep", "", "b.rep", jobReport(), "the last of several"},
        {"render job.json -o a.rep -o b.dat --as text", "", "a.rep", jobReport(),
         "the option names the kind only where the file name does not"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 0) << row.line << "\n" << run.all().constData();
        EXPECT_EQ(run.out, row.out) << row.reason;
        EXPECT_EQ(run.err.toStdString(), "") << row.reason;
        if (row.file != nullptr) {
            EXPECT_EQ(folder.bytesOf(row.file).toStdString(), row.bytes.toStdString()) << row.reason;
        }
    }
}

TEST(CommandLineOutput, TheOptionOverridesTheJobsOutputs)
{
    const CommandLineFolder folder;
    folder.put("out.json", R"({"header": false, "page": {"linesPerPage": 9, "charsPerRow": 9},
        "report": [{"line": "a"}], "output": ["own.txt", {"file": "own.dat", "as": "rep"}, "-"]})");
    const ProgramRun own = folder.run("render out.json");
    EXPECT_EQ(own.status, 0) << own.all().constData();
    EXPECT_EQ(own.out, "a\n");
    EXPECT_EQ(folder.bytesOf("own.txt"), "a\n");
    EXPECT_EQ(folder.bytesOf("own.dat"), "\xEF\xBB\xBF"
                                         "a\r\r\n");
    QFile::remove(folder.path("own.txt"));
    const ProgramRun other = folder.run("render out.json -o other.txt");
    EXPECT_EQ(other.status, 0) << other.all().constData();
    EXPECT_EQ(other.out, "");
    EXPECT_EQ(folder.bytesOf("other.txt"), "a\n");
    EXPECT_FALSE(QFile::exists(folder.path("own.txt")));
}

TEST(CommandLineOutput, TheOptionNamesTheKindOfAJobsOutputThatDoesNot)
{
    const CommandLineFolder folder;
    folder.put("out.json", R"({"header": false, "page": {"linesPerPage": 9, "charsPerRow": 9},
        "report": [{"line": "a"}], "output": ["own.dat"]})");
    const ProgramRun run = folder.run("render out.json --as text");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_TRUE(QFile::exists(folder.path("own.dat")));
}

TEST(CommandLineOutput, PathsOfAJobAreRelativeToItThoseOfOptionsToTheFolderAtHand)
{
    const CommandLineFolder folder;
    ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("in")));
    for (const char *name : {"t.xml", "points.csv", "job.json"}) {
        ASSERT_TRUE(QFile::rename(folder.path(name), folder.path("in/") + QString::fromUtf8(name)));
    }
    const ProgramRun here = folder.run("render in/job.json -o here.txt");
    EXPECT_EQ(here.status, 0) << here.all().constData();
    EXPECT_EQ(folder.bytesOf("here.txt"), jobText());
    const ProgramRun there = folder.run(QStringList{QStringLiteral("render"), QStringLiteral("in/job.json"),
                                                    QStringLiteral("--set"), QStringLiteral("output=[\"there.txt\"]")});
    EXPECT_EQ(there.status, 0) << there.all().constData();
    EXPECT_EQ(folder.bytesOf("in/there.txt"), jobText());
}

TEST(CommandLineOutput, AnOutputThatCannotBeWrittenIsStatus3)
{
    struct Row
    {
        const char *output;
        const char *reason;
    };
    constexpr Row rows[] = {{"folder.rep", "a folder of that name"},
                            {"folder.txt", "a folder of that name, which is not empty"},
                            {"none/out.rep", "a folder that is not there"},
                            {"job.json/out.txt", "a file is not a folder"}};
    for (const Row &row : rows) {
        CommandLineFolder folder;
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("folder.rep")));
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("folder.txt")));
        folder.put("folder.txt/inside", "kept");
        const QByteArray job = folder.bytesOf("job.json");
        const ProgramRun run = folder.run(words("render job.json -o") << QString::fromUtf8(row.output));
        EXPECT_EQ(run.status, 3) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.reason;
        EXPECT_TRUE(run.err.contains(row.output)) << row.reason << "\n" << run.err.constData();
        EXPECT_EQ(run.err.count('\n'), 1) << row.reason;
        EXPECT_EQ(folder.names(), words("job.json points.csv t.xml")) << row.reason << ": nothing is left behind";
        EXPECT_EQ(folder.bytesOf("job.json"), job) << row.reason;
        EXPECT_EQ(folder.bytesOf("folder.txt/inside"), "kept") << row.reason;
    }
}

TEST(CommandLineOutput, AnEmptyReportMakesNoReportFile)
{
    const CommandLineFolder folder;
    folder.put("job.json", R"({"report": [], "page": {"linesPerPage": 9, "charsPerRow": 9}})");
    const ProgramRun loud = folder.run("render job.json -o a.rep");
    EXPECT_EQ(loud.status, 0);
    EXPECT_TRUE(loud.err.contains("a.rep")) << "it is said that there is none";
    EXPECT_FALSE(QFile::exists(folder.path("a.rep")));
    const ProgramRun quiet = folder.run("render job.json -o a.rep -o a.txt --quiet");
    EXPECT_EQ(quiet.status, 0);
    EXPECT_EQ(quiet.err, "");
    EXPECT_EQ(folder.bytesOf("a.txt"), "");
}

TEST(CommandLineOutput, NamesOutsideAsciiAreFilesToo)
{
    const CommandLineFolder folder;
    const QString name = QString::fromUtf8("Gr\xC3\xB6\xC3\x9F"
                                           "e \xE6\xB8\xAC.txt");
    const ProgramRun run = runProgram(folder.path(), words("render job.json -o") << name, {{"LC_ALL", "C.UTF-8"}});
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(folder.bytesOf(name.toUtf8().constData()), jobText());
}

} // namespace
