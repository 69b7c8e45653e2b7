#include "CommandLine.h"

#include <QDir>
#include <QFileInfo>

#include <gtest/gtest.h>

namespace
{

TEST(CommandLineParents, AMissingFolderIsNamedOrMade)
{
    struct Row
    {
        const char *line;
        const char *file;    ///< that is written with --parents
        const char *missing; ///< the folder that a message names
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render job.json -o new/out.txt", "new/out.txt", "new", "text, which is written while it is made"},
        {"render job.json -o new/out.pdf", "new/out.pdf", "new", "another kind"},
        {"render job.json -o new/a/b/out.rep", "new/a/b/out.rep", "new", "the first that is missing"},
        {"render job.json -o there/a/out.rep", "there/a/out.rep", "there/a", "below one that is there"},
        {"render job.json -o a.txt -o new/out.rep", "new/out.rep", "new", "one of two"},
        {"render job.json -o new/{}.txt", "new/job.txt", "new", "named after the job"},
        {"render job.json --set output=[\"new/out.txt\"]", "new/out.txt", "new", "the job's own"},
        {"render job.json -o link.txt", "new/out.txt", "new", "where a link leads"},
        {"render job.json -o a.txt --notes new/notes.json", "new/notes.json", "new", "notes"},
        {"check job.json --notes new/notes.json", "new/notes.json", "new", "notes of a check"},
        {"convert saved.rep new/out.txt", "new/out.txt", "new", "a converted report"},
        {"render job.json other.json -o new/{}.txt", "new/other.txt", "new", "several jobs"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("there")));
        ASSERT_TRUE(QFile::link(QStringLiteral("new/out.txt"), folder.path("link.txt")));
        folder.put("other.json", folder.bytesOf("job.json"));
        folder.put("saved.rep", jobReport());
        const ProgramRun without = folder.run(row.line);
        EXPECT_EQ(without.status, 3) << row.reason << without.all().constData();
        EXPECT_TRUE(without.err.contains(QByteArray(" could not be written: there is no folder \"") + row.missing) ||
                    without.err.contains(QByteArray(" could not be written: there is no folder \"") +
                                         folder.path(row.missing).toUtf8()))
            << row.reason << without.all().constData();
        EXPECT_TRUE(without.err.contains("; --parents creates it\n")) << row.reason << without.all().constData();
        EXPECT_FALSE(QFileInfo::exists(folder.path("new"))) << row.reason;
        const ProgramRun with = folder.run(words(row.line) << QStringLiteral("--parents"));
        EXPECT_EQ(with.status, 0) << row.reason << with.all().constData();
        EXPECT_GT(QFileInfo(folder.path(row.file)).size(), 0) << row.reason;
    }
}

TEST(CommandLineParents, NoFolderIsMadeForNothing)
{
    struct Row
    {
        const char *line;
        int status;
        const char *said;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render none.json --parents -o new/out.rep", 2, "none.json", "no job"},
        {"render wrong.json --parents -o new/out.pdf", 2, "points.csv", "wrong data"},
        {"render job.json --parents -o job.json/x/out.txt", 3,
         "the folder \"job.json/x\" could not be created: ", "a file in its place"},
        {"render job.json --parents -o new/../job.json --as text", 2, "is the job itself",
         "out of the new folder again"},
        {"render job.json --parents -o new/out.txt -o ./new/x/../out.txt", 2, "is the file of the output",
         "one file by two names"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const QByteArray job = folder.bytesOf("job.json");
        folder.put("wrong.json", folder.bytesOf("job.json").replace("points.csv", "gone-points.csv"));
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << row.reason << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.said)) << row.reason << run.all().constData();
        EXPECT_FALSE(QFileInfo::exists(folder.path("new"))) << row.reason;
        EXPECT_EQ(folder.bytesOf("job.json"), job) << row.reason;
    }
}

} // namespace
