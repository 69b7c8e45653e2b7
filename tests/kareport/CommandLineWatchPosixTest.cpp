#include "CommandLine.h"

#include <QDir>
#include <QFileInfo>

#include <csignal>
#include <cstdio>
#include <sys/types.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <functional>

namespace
{

/// A job with an output, which is watched.
class Watched : public CommandLineFolder
{
public:
    explicit Watched(const QStringList &more = {})
    {
        put("job.json", bytesOf("job.json").replace("]}\n", "], \"output\": [\"out.txt\"]}"));
        process_.setWorkingDirectory(path());
        process_.setChildProcessModifier([] {
            for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
                std::signal(signal, SIG_DFL); // who runs the tests may have switched it off
            }
        });
        process_.setReadChannel(QProcess::StandardError);
        arguments_ = words("watch job.json") + more;
    }
    ~Watched()
    {
        process_.kill();
        process_.waitForFinished();
    }
    Watched(const Watched &) = delete;
    Watched &operator=(const Watched &) = delete;

    void start() { process_.start(QStringLiteral(KAREPORT_PROGRAM), arguments_, QIODevice::ReadOnly); }
    /// Waits until the program has said something so many times, since it was started.
    bool waitFor(const char *text, int count)
    {
        while (err.count(text) < count && process_.waitForReadyRead(20'000)) {
            err += process_.readAllStandardError();
        }
        return err.count(text) >= count;
    }
    ProgramRun end(int signal)
    {
        kill(static_cast<pid_t>(process_.processId()), signal);
        ProgramRun run = endOf(process_);
        run.err.prepend(err);
        return run;
    }
    qint64 processId() const { return process_.processId(); }

    QByteArray err;

private:
    QProcess process_;
    QStringList arguments_;
};

constexpr const char *made = ": made in ";
constexpr const char *notMade = ": failed; earlier outputs are unchanged\n";

TEST(CommandLineWatch, ItMakesTheReportAtOnceAndOnEachChange)
{
    const auto replaced = [](const Watched &t, const char *name, const QByteArray &bytes) {
        t.put("new", bytes);
        EXPECT_EQ(std::rename(qPrintable(t.path("new")), qPrintable(t.path(name))), 0);
    };
    struct Row
    {
        std::function<void(const Watched &)> change;
        QByteArray text;
        const char *reason;
    };
    const QByteArray head = "\xC3\xA4\nPt   |    North\n\n";
    const Row rows[] = {
        {[](const Watched &t) { t.put("points.csv", "Number,Northing\n3,1\n"); }, head + "3    |    1.000\n", "data"},
        {[](const Watched &t) { t.put("points.csv", "Number,Northing\n4,1\n"); }, head + "4    |    1.000\n",
         "of the same size"},
        {[&](const Watched &t) { replaced(t, "points.csv", "Number,Northing\n5,1\n"); }, head + "5    |    1.000\n",
         "another file in its place"},
        {[&](const Watched &t) { replaced(t, "points.csv", "Number,Northing\n6,1\n"); }, head + "6    |    1.000\n",
         "and once more"},
        {[](const Watched &t) { t.put("t.xml", t.bytesOf("t.xml").replace("<Label>Pt<", "<Label>No<")); },
         "\xC3\xA4\nNo   |    North\n\n6    |    1.000\n", "the template"},
        {[](const Watched &t) { t.put("job.json", t.bytesOf("job.json").replace("\"\xC3\xA4\"", "\"B\"")); },
         "B\nNo   |    North\n\n6    |    1.000\n", "the job"},
        {[](const Watched &t) {
             QFile::remove(t.path("points.csv"));
             t.put("job.json", t.bytesOf("job.json").replace("points.csv", "other.csv"));
         },
         "B\nNo   |    North\n\n7    |    1.000\n", "other data, and the earlier is gone"},
        {[](const Watched &t) { t.put("other.csv", "Number,Northing\n8,1\n"); },
         "B\nNo   |    North\n\n8    |    1.000\n", "which is watched now"},
    };
    Watched t;
    t.put("other.csv", "Number,Northing\n7,1\n");
    t.start();
    ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
    EXPECT_EQ(t.bytesOf("out.txt"), jobText()) << "at once";
    EXPECT_EQ(t.err.count(made), 1) << t.err.constData();
    EXPECT_TRUE(t.err.contains(" s: out.txt\n")) << t.err.constData();
    EXPECT_TRUE(t.err.contains("watching job.json, t.xml, points.csv; ")) << t.err.constData();
    int runs = 1;
    for (const Row &row : rows) {
        row.change(t);
        ASSERT_TRUE(t.waitFor(made, ++runs)) << row.reason << "\n" << t.err.constData();
        EXPECT_EQ(t.bytesOf("out.txt").toStdString(), row.text.toStdString()) << row.reason;
    }
    t.put("points.csv", "Number,Northing\n9,1\n");
    t.put("other.csv", "Number,Northing\n10,1\n");
    ASSERT_TRUE(t.waitFor(made, ++runs));
    EXPECT_EQ(t.err.count(made), runs) << "outputs, and files that are no longer data of the job, start no run\n"
                                       << t.err.constData();
    EXPECT_EQ(t.err.count(notMade), 0) << t.err.constData();
}

TEST(CommandLineWatch, WhatIsWrongIsSaidAndTheOutputStays)
{
    struct Row
    {
        const char *name;
        QByteArray wrong; ///< empty for a file that is gone
        const char *said;
        const char *reason;
    };
    const Row rows[] = {
        {"job.json", "{\"report\": [", "job.json:1:", "half a job, as an editor may leave it"},
        {"job.json", "", nullptr, "no job: it may come back"},
        {"t.xml", "<ReportTemplate>", "t.xml:", "half a template"},
        {"points.csv", "Number,Northing\n1,x\n", "points.csv:2:3: error:", "wrong data"},
        {"points.csv", "", nullptr, "no data"},
    };
    for (const Row &row : rows) {
        Watched t;
        t.start();
        ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
        const QByteArray right = t.bytesOf(row.name);
        if (row.wrong.isEmpty()) {
            ASSERT_TRUE(QFile::remove(t.path(row.name)));
            // A file that is gone may be in the middle of being replaced: another change makes the run.
            t.put(QByteArray(row.name) == "job.json" ? "points.csv" : "job.json",
                  t.bytesOf(QByteArray(row.name) == "job.json" ? "points.csv" : "job.json") + "\n");
        } else {
            t.put(row.name, row.wrong);
        }
        ASSERT_TRUE(t.waitFor(notMade, 1)) << row.reason << "\n" << t.err.constData();
        EXPECT_TRUE(row.said == nullptr || t.err.contains(row.said)) << row.reason << "\n" << t.err.constData();
        EXPECT_EQ(t.bytesOf("out.txt"), jobText()) << row.reason;
        t.put(row.name, right);
        ASSERT_TRUE(t.waitFor(made, 2)) << row.reason << ": it is right again\n" << t.err.constData();
    }
}

TEST(CommandLineWatch, AFolderThatIsNotThereYetIsWaitedFor)
{
    Watched t;
    t.put("job.json", t.bytesOf("job.json").replace("points.csv", "in/deep/points.csv"));
    t.start();
    ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
    EXPECT_TRUE(t.err.contains(notMade)) << "the data is missing\n" << t.err.constData();
    ASSERT_TRUE(QDir(t.path()).mkpath(QStringLiteral("in/deep")));
    t.put("in/deep/points.csv", "Number,Northing\n1,12.5\n2A,0\n");
    ASSERT_TRUE(t.waitFor(made, 1)) << t.err.constData();
    EXPECT_EQ(t.bytesOf("out.txt"), jobText());
}

TEST(CommandLineWatch, ASignalEndsItAsItEndsOtherCommands)
{
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        Watched t;
        t.start();
        ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
        const ProgramRun run = t.end(signal);
        EXPECT_EQ(run.signal, signal) << run.all().constData();
        EXPECT_EQ(run.out, "");
        EXPECT_TRUE(run.err.endsWith("press Ctrl+C to stop\n")) << "nothing was being written\n" << run.err.constData();
    }
}

TEST(CommandLineWatch, WhileNothingChangesNothingIsDone)
{
    Watched t;
    t.start();
    ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
    const auto switches = [&t] {
        QFile file(QStringLiteral("/proc/%1/status").arg(t.processId()));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        const QByteArray status = file.readAll();
        return status.mid(status.indexOf("\nvoluntary_ctxt_switches:") + 25).trimmed().split('\n').first().toInt();
    };
    // Its own output is looked at first. A program that wakes up to look for changes never comes to rest.
    bool isAtRest = false;
    for (int look = 0; look < 40 && !isAtRest; ++look) {
        const int before = switches();
        ASSERT_GT(before, 0);
        usleep(500'000);
        isAtRest = switches() == before;
    }
    EXPECT_TRUE(isAtRest);
}

TEST(CommandLineWatch, OptionsAreThoseOfRender)
{
    Watched t(words("-o new/other.txt --set report.0.line=x --parents --notes notes.json"));
    t.put("points.csv", "Number,Northing,Colour\n1,2,3\n");
    t.start();
    ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
    EXPECT_EQ(t.bytesOf("new/other.txt"), "x\nPt   |    North\n\n1    |    2.000\n");
    EXPECT_TRUE(t.err.contains("s: new/other.txt, 1 note\n")) << t.err.constData();
    EXPECT_TRUE(t.bytesOf("notes.json").contains("Colour"));
    EXPECT_FALSE(QFileInfo::exists(t.path("out.txt")));

    Watched quiet(words("--quiet"));
    quiet.start();
    while (!QFileInfo::exists(quiet.path("out.txt"))) {
        usleep(1000);
    }
    const ProgramRun run = quiet.end(SIGTERM);
    EXPECT_FALSE(run.err.contains(made) || run.err.contains("watching")) << run.err.constData();
}

TEST(CommandLineWatch, WhatCannotBeWatchedIsRefused)
{
    struct Row
    {
        const char *line;
        int status;
        const char *said;
    };
    constexpr Row rows[] = {
        {"watch", 1, "watch: JOB was expected"},
        {"watch -", 1, "standard input can be read only once: a job file was expected"},
        {"watch none.json", 2, "there is no file \"none.json\""},
        {"watch job.json --as doc", 1, "--as"},
        {"watch job.json --set title.x=5", 1, "\"title.x\""},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("job.json", folder.bytesOf("job.json").replace("{\"header\"", "{\"title\": \"T\", \"header\""));
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << row.line << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.said)) << row.line << run.all().constData();
    }
    Watched t;
    t.put("job.json", t.bytesOf("job.json").replace("points.csv", "-"));
    t.start();
    ASSERT_TRUE(t.waitFor("press Ctrl+C to stop\n", 1)) << t.err.constData();
    EXPECT_TRUE(t.err.contains("standard input can be read only once: a file was expected")) << t.err.constData();
}

} // namespace
