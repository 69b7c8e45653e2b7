#include "CommandLine.h"

#include <QDir>
#include <QFileInfo>

#include <gtest/gtest.h>

namespace
{

TEST(CommandLineNew, WhatItWritesRunsAndIsClean)
{
    struct Row
    {
        const char *folder; ///< as it is given; null for none
        const char *name;   ///< of the files, with their folder
        const char *command;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"harbour", "harbour/harbour", "kareport render harbour/harbour.json", "a new folder"},
        {"./harbour/", "harbour/harbour", "kareport render harbour/harbour.json", "written otherwise"},
        {"Job 17", "Job 17/Job 17", "kareport render 'Job 17/Job 17.json'", "a blank, which a shell would take apart"},
        {"a \"b\" \\c", "a \"b\" \\c/a \"b\" \\c", "kareport render 'a \"b\" \\c/a \"b\" \\c.json'",
         "signs that JSON writes otherwise"},
        {"Stra\xC3\x9F"
         "e@FILE@",
         "Stra\xC3\x9F"
         "e@FILE@/Stra\xC3\x9F"
         "e@FILE@",
         "kareport render Stra\xC3\x9F"
         "e@FILE@/Stra\xC3\x9F"
         "e@FILE@.json",
         "letters outside ASCII, and what is a mark in the files"},
        {"here", "here/here", "kareport render here/here.json", "a folder that is there"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("here")));
        const QString name = QString::fromUtf8(row.name);
        const ProgramRun run = folder.run({QStringLiteral("new"), QString::fromUtf8(row.folder)});
        EXPECT_EQ(run.status, 0) << row.reason << run.all().constData();
        EXPECT_EQ(run.err, "") << row.reason;
        EXPECT_EQ(QString::fromUtf8(run.out),
                  QStringLiteral("Created %1.xml (template), %1.csv (data), %1.json (job)\nNext: %2\n")
                      .arg(name, QString::fromUtf8(row.command)))
            << row.reason;
        const QString job = name + QStringLiteral(".json");
        const ProgramRun check = folder.run({QStringLiteral("check"), QStringLiteral("--strict"),
                                             QStringLiteral("--quiet"), name + QStringLiteral(".xml"), job});
        EXPECT_EQ(check.status, 0) << row.reason << check.all().constData();
        EXPECT_EQ(check.out + check.err, "") << row.reason;
        const ProgramRun loud = folder.run({QStringLiteral("check"), QStringLiteral("--strict"), job});
        EXPECT_FALSE(loud.out.contains("warning:") || loud.out.contains("error:")) << loud.all().constData();
        const ProgramRun render = folder.run({QStringLiteral("render"), QStringLiteral("--strict"), job});
        EXPECT_EQ(render.status, 0) << row.reason << render.all().constData();
        EXPECT_EQ(render.err, "") << row.reason;
        for (const char *ending : {".rep", ".pdf"}) {
            EXPECT_GT(QFileInfo(folder.path() + u'/' + name + QLatin1StringView(ending)).size(), 500) << ending;
        }
        const ProgramRun text = folder.run({QStringLiteral("render"), job, QStringLiteral("-o"), QStringLiteral("-")});
        EXPECT_TRUE(text.out.contains(QFileInfo(name).fileName().toUtf8())) << text.all().constData() << "the title";
        EXPECT_TRUE(text.out.contains("manhole, centre of cover")) << text.all().constData();
    }
}

TEST(CommandLineNew, WithoutAFolderItIsTheCurrentOne)
{
    const CommandLineFolder folder;
    const QString name = QFileInfo(folder.path()).fileName();
    const ProgramRun run = folder.run("new");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_TRUE(run.out.endsWith("Next: kareport render " + name.toUtf8() + ".json\n")) << run.all().constData();
    EXPECT_TRUE(folder.names().contains(name + QStringLiteral(".csv")));
    EXPECT_EQ(folder.run("new --quiet").status, 3) << "they are there now";
    const CommandLineFolder other;
    EXPECT_EQ(other.run("new --quiet").out, "");
}

TEST(CommandLineNew, NothingIsReplaced)
{
    for (const char *existing : {"x/x.xml", "x/x.csv", "x/x.json"}) {
        const CommandLineFolder folder;
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("x")));
        folder.put(existing, "kept");
        const ProgramRun run = folder.run("new x");
        EXPECT_EQ(run.status, 3) << run.all().constData();
        EXPECT_EQ(run.err, QByteArray("kareport: \"") + existing + "\" already exists; nothing was written\n");
        EXPECT_EQ(run.out, "");
        EXPECT_EQ(folder.bytesOf(existing), "kept");
        EXPECT_EQ(QDir(folder.path("x")).entryList(QDir::Files).size(), 1) << existing;
    }
    const CommandLineFolder folder;
    ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("x")));
    ASSERT_TRUE(QFile::link(QStringLiteral("nowhere"), folder.path("x/x.csv")));
    EXPECT_EQ(folder.run("new x").status, 3) << "a link that leads nowhere is there as well";
    EXPECT_FALSE(QFileInfo::exists(folder.path("x/nowhere")));
}

TEST(CommandLineNew, AFolderThatCannotBeMadeIsNamed)
{
    struct Row
    {
        const char *line;
        const char *said;
        bool isMade;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"new a/b/c", "\"a/b/c\" could not be created: there is no folder \"a\"; --parents creates it", false,
         "two are missing"},
        {"new a/b/c --parents", "", true, "and are made"},
        {"new job.json", "\"job.json\" could not be created: ", false, "a file"},
        {"new job.json/x --parents", "\"job.json/x\" could not be created: ", false, "a file on the way"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const QByteArray job = folder.bytesOf("job.json");
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.isMade ? 0 : 3) << row.reason << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.said)) << row.reason << run.all().constData();
        EXPECT_EQ(QFileInfo::exists(folder.path("a/b/c/c.json")), row.isMade) << row.reason;
        EXPECT_EQ(QFileInfo::exists(folder.path("a")), row.isMade) << row.reason;
        EXPECT_EQ(folder.bytesOf("job.json"), job);
    }
}

} // namespace
