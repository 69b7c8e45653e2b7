#include "CommandLine.h"

#include <QFileInfo>

#include <unistd.h>

#include <gtest/gtest.h>

// An output never takes the place of what its report is made of, or of another output, by whatever name it comes.

namespace
{

/// A folder with links to the job's files, and a report to convert.
class LinkedFolder : public CommandLineFolder
{
public:
    LinkedFolder()
    {
        EXPECT_TRUE(QDir(path()).mkdir(QStringLiteral("sub")));
        EXPECT_EQ(symlink("points.csv", qPrintable(path("symbolic.txt"))), 0);
        EXPECT_EQ(link(qPrintable(path("points.csv")), qPrintable(path("hard.txt"))), 0);
        EXPECT_EQ(symlink("new.txt", qPrintable(path("dangling.txt"))), 0);
        EXPECT_EQ(symlink(".", qPrintable(path("here"))), 0);
        put("saved.rep", jobReport());
        put("twice.json", bytesOf("job.json").replace("]}\n", "], \"output\": [\"a.txt\",\n \"sub/../a.txt\"]}"));
        put("two.json", bytesOf("job.json"));
        put("list", "job.json\ntwo.json\n");
    }

    QByteArray all() const
    {
        QByteArray content;
        for (const QString &name : names()) {
            content += name.toUtf8() + '\n' + bytesOf(qPrintable(name)) + '\n';
        }
        return content;
    }
};

TEST(CommandLineClash, NothingIsWrittenWhereAnOutputWouldTakeTheWrongPlace)
{
    struct Row
    {
        const char *line;
        const char *error;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render job.json --as text -o job.json", "\"job.json\" is the job itself: ", "the job"},
        {"render job.json --as text -o t.xml", "\"t.xml\" is the template of the job: ", "the template"},
        {"render job.json --as text -o points.csv", "\"points.csv\" is data of the job: ", "the data"},
        {"render job.json -o symbolic.txt", "\"symbolic.txt\" is data of the job: ", "through a link"},
        {"render job.json -o hard.txt", "\"hard.txt\" is data of the job: ", "by its other name"},
        {"render job.json --as text -o sub/../points.csv", " is data of the job: ", "on another way"},
        {"render job.json --as text -o here/points.csv", " is data of the job: ", "through a linked folder"},
        {"render --template t.xml --name CONTROL --table Points --data points.csv --as text -o points.csv",
         "\"points.csv\" is data of the job: ", "the short form"},
        {"render job.json -o a.txt -o a.txt",
         "\"a.txt\" is the file of the output \"a.txt\" already: ", "one name twice"},
        {"render job.json -o a.txt -o ./a.txt", "\"./a.txt\" is the file of the output \"a.txt\"", "in other words"},
        {"render job.json -o new.txt -o dangling.txt", "\"dangling.txt\" is the file of the output \"new.txt\"",
         "a link to what is not there yet"},
        {"render job.json -o here/a.txt -o a.txt", "\"a.txt\" is the file of the output \"here/a.txt\"",
         "a new file in a linked folder"},
        {"render job.json --update -o a.txt -o a.txt", "already: ", "before it is looked whether all is up to date"},
        {"render twice.json", "twice.json:5:2: error: ", "in the job, with its place"},
        {"render job.json two.json --as text -o here/{}.json", "is the job itself: ", "each job of a batch"},
        {"render job.json two.json --as text --set output=[\"two.json\"]",
         "two.json\" is the file \"two.json\" of this batch: ", "another job of the batch"},
        {"render --jobs list --as text --set output=[\"list\"]", "\" is the file \"list\" of this batch: ", "its list"},
        {"render --jobs list --slice 1/2 --as text --set output=[\"two.json\"]",
         "of this batch: ", "a job that another process makes"},
        {"convert saved.rep saved.rep", "the output \"saved.rep\" is the report being read: ", "a conversion"},
        {"convert saved.rep here/saved.rep", "is the report being read: ", "in other words"},
    };
    for (const Row &row : rows) {
        const LinkedFolder folder;
        const QByteArray before = folder.all();
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 2) << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.error)) << row.reason << "\n" << run.err.constData();
        EXPECT_TRUE(folder.all() == before) << row.reason;
    }
}

TEST(CommandLineClash, ItIsSaidBeforeDataIsRead)
{
    const LinkedFolder folder;
    folder.put("points.csv", "Number,Northing\n1,x\n");
    const ProgramRun run = folder.run("render job.json -o a.txt -o a.txt");
    EXPECT_EQ(run.status, 2);
    EXPECT_TRUE(run.err.contains("already: ")) << run.err.constData();
}

TEST(CommandLineClash, WhatOnlyLooksAlikeIsWritten)
{
    constexpr const char *lines[] = {
        "render job.json -o a.txt -o A.txt", // two files where letters count
        "render job.json -o - -o -",         // both are in standard output
        "render job.json --as text -o /dev/null -o /dev/null",
        "render job.json -o sub/points.txt -o points.txt",
        "render job.json two.json -o {}.txt",
        "convert saved.rep saved.txt",
    };
    for (const char *line : lines) {
        const LinkedFolder folder;
        const ProgramRun run = folder.run(line);
        EXPECT_EQ(run.status, 0) << line << "\n" << run.all().constData();
    }
}

TEST(CommandLineClash, StandardOutputIsAFileAsWell)
{
    const LinkedFolder folder;
    const QByteArray before = folder.all();
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.setStandardOutputFile(folder.path("points.csv"), QIODevice::Append);
    process.start(QStringLiteral(KAREPORT_PROGRAM), words("render job.json"), QIODevice::ReadOnly);
    const ProgramRun run = endOf(process);
    EXPECT_EQ(run.status, 2) << run.all().constData();
    EXPECT_TRUE(folder.all() == before);
}

} // namespace
