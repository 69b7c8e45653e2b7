#include "CommandLine.h"

#include <csignal>
#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

// What a caller leaves to the program: descriptors that are closed, signals, limits.

namespace
{

/// Runs the program in a folder, with what a caller in the system's own terms prepares in the new process.
ProgramRun runPrepared(const QString &folder, const char *line, const std::function<void()> &prepare)
{
    QProcess process;
    process.setWorkingDirectory(folder);
    process.setChildProcessModifier(prepare);
    process.start(QStringLiteral(KAREPORT_PROGRAM), words(line), QIODevice::ReadOnly);
    return endOf(process);
}

TEST(CommandLineProcess, NoFileTakesTheNumberOfAClosedDescriptor)
{
    struct Row
    {
        const char *line;
        std::vector<int> closed;
        int status;
        const char *reason;
    };
    const Row rows[] = {
        {"render job.json -o out.txt --progress", {2}, 0, "messages would be in the report"},
        {"render job.json -o out.txt --progress", {0, 1, 2}, 0, "all of them"},
        {"render job.json -o out.txt --progress", {0, 2}, 0, "the output would be the second file that is opened"},
        {"render job.json -o out.txt --progress", {1, 2}, 0, "the same"},
        {"render job.json -o out.txt --progress", {0}, 0, "the first file opened would be standard input"},
        {"render job.json -o -", {1}, 3, "a report without a reader is not written"},
        {"render job.json -o -", {0, 1, 2}, 3, "and nothing can be said"},
        {"render --jobs - -o {}.txt", {0}, 2, "a list from nowhere is not read"},
        {"templates t.xml", {1}, 3, "a list without a reader"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = runPrepared(folder.path(), row.line, [&row] {
            for (const int descriptor : row.closed) {
                close(descriptor);
            }
        });
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        if (row.status == 0) {
            EXPECT_EQ(folder.bytesOf("out.txt"), jobText()) << row.reason;
        }
    }
}

TEST(CommandLineProcess, WithoutAReaderTheWorkEndsWithoutAWord)
{
    struct Row
    {
        const char *line;
        bool isIgnored; ///< whether the caller has switched the signal off
        int signal;
        int status;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render job.json -o - -o late.rep", false, SIGPIPE, -1, "as other programs end"},
        {"render job.json -o - -o late.rep", true, 0, 3, "some callers leave the signal switched off"},
        {"render job.json -o late.rep -o -", false, SIGPIPE, -1, "nothing else is made first"},
        {"render wrong.json", false, SIGPIPE, -1, "while rows are read: the mistake in the last one is not come to"},
        {"render wrong.json", true, 0, 3, "the same"},
        {"templates t.xml", true, 0, 3, "a list"},
    };
    const CommandLineFolder folder;
    folder.put("wrong.csv", "Number,Northing\n" + QByteArray("1,2.5\n").repeated(300'000) + "1,x\n");
    folder.put("wrong.json", folder.bytesOf("job.json").replace("points.csv", "wrong.csv"));
    for (const Row &row : rows) {
        const ProgramRun run = runPrepared(folder.path(), row.line, [&row] {
            int ends[2];
            if (pipe(ends) == 0) {
                dup2(ends[1], STDOUT_FILENO);
                close(ends[0]);
                close(ends[1]);
            }
            std::signal(SIGPIPE, row.isIgnored ? SIG_IGN : SIG_DFL);
        });
        EXPECT_EQ(run.signal, row.signal) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.status, row.status) << row.reason;
        EXPECT_EQ(run.err, "") << row.reason;
        EXPECT_EQ(folder.names(), words("job.json points.csv t.xml wrong.csv wrong.json")) << row.reason;
    }
}

TEST(CommandLineProcess, AFileSizeLimitFailsOneJobOfABatch)
{
    const CommandLineFolder folder;
    QByteArray csv = "Number,Northing\n";
    for (int i = 0; i < 20'000; ++i) {
        csv += "1,2.5\n";
    }
    folder.put("big.csv", csv);
    folder.put("big.json", folder.bytesOf("job.json").replace("points.csv", "big.csv"));
    folder.put("big.rep", "kept");
    const ProgramRun run = runPrepared(folder.path(), "render big.json job.json -o {}.rep", [] {
        const rlimit limit = {100'000, 100'000};
        setrlimit(RLIMIT_FSIZE, &limit);
    });
    EXPECT_EQ(run.status, 3) << run.all().constData();
    EXPECT_TRUE(run.err.contains("\"big.rep\" could not be written: File too large")) << run.err.constData();
    EXPECT_EQ(folder.bytesOf("big.rep"), "kept");
    EXPECT_EQ(folder.bytesOf("job.rep"), jobReport()) << "the rest of the batch is made";
}

/// Waits until the program is blocked in opening or reading what is never written, signals it, and answers its end.
ProgramRun runBlocked(const CommandLineFolder &folder, const char *line, int signal)
{
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.setChildProcessModifier([signal] { std::signal(signal, SIG_DFL); });
    process.start(QStringLiteral(KAREPORT_PROGRAM), words(line), QIODevice::ReadOnly);
    EXPECT_TRUE(process.waitForStarted(30'000));
    const std::string wait = "/proc/" + std::to_string(process.processId()) + "/wchan";
    for (int turn = 0; turn < 600; ++turn) {
        QFile state(QString::fromStdString(wait));
        const QByteArray place = state.open(QIODevice::ReadOnly) ? state.readAll() : QByteArray();
        if (place.contains("wait_for_partner") || place.contains("pipe")) {
            break;
        }
        process.waitForFinished(5);
    }
    kill(static_cast<pid_t>(process.processId()), signal);
    return endOf(process);
}

TEST(CommandLineProcess, TheFirstSignalEndsAReadThatWaits)
{
    for (const int signal : {SIGTERM, SIGINT, SIGHUP}) {
        const CommandLineFolder folder;
        ASSERT_EQ(mkfifo(qPrintable(folder.path("pipe.csv")), 0600), 0);
        folder.put("wait.json", folder.bytesOf("job.json").replace("points.csv", "pipe.csv"));
        folder.put("out.rep", "kept");
        // The pipe has not been opened yet; then it has been, but nothing is written.
        ProgramRun run = runBlocked(folder, "render wait.json -o out.rep", signal);
        EXPECT_EQ(run.signal, signal) << run.all().constData();
        const int writer = open(qPrintable(folder.path("pipe.csv")), O_RDWR);
        ASSERT_GE(writer, 0);
        run = runBlocked(folder, "render wait.json -o out.rep", signal);
        EXPECT_EQ(run.signal, signal) << run.all().constData();
        EXPECT_EQ(folder.bytesOf("out.rep"), "kept");
        run = runBlocked(folder, "render wait.json job.json -o {}.rep", signal);
        EXPECT_EQ(run.signal, signal) << "none of a batch is made any more\n" << run.all().constData();
        run = runBlocked(folder, "check wait.json job.json", signal);
        EXPECT_EQ(run.signal, signal) << "nothing more is checked\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << run.all().constData();
        EXPECT_EQ(folder.names(), words("job.json out.rep points.csv t.xml wait.json"));
        close(writer);
    }
}

TEST(CommandLineProcess, WorkThatComesToNoSafePointIsEndedAllTheSame)
{
    for (const int signal : {SIGTERM, SIGINT}) {
        const CommandLineFolder folder;
        ASSERT_EQ(mkfifo(qPrintable(folder.path("pipe.json")), 0600), 0);
        // A job file is read by a part that knows nothing of signals.
        const ProgramRun run = runBlocked(folder, "render job.json pipe.json -o {}.rep", signal);
        EXPECT_EQ(run.signal, signal) << run.all().constData();
        EXPECT_EQ(run.err, "kareport: stopped; no output is half written\n");
        EXPECT_EQ(folder.bytesOf("job.rep"), jobReport()) << "what was finished stays";
    }
}

TEST(CommandLineProcess, ASignalThatTheCallerSwitchedOffDoesNotStopTheWork)
{
    const CommandLineFolder folder;
    ASSERT_EQ(mkfifo(qPrintable(folder.path("pipe.csv")), 0600), 0);
    folder.put("wait.json", folder.bytesOf("job.json").replace("points.csv", "pipe.csv"));
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.setChildProcessModifier([] { std::signal(SIGHUP, SIG_IGN); });
    process.start(QStringLiteral(KAREPORT_PROGRAM), words("render wait.json -o out.txt"), QIODevice::ReadOnly);
    ASSERT_TRUE(process.waitForStarted(30'000));
    // Opened when the program reads it.
    const int writer = open(qPrintable(folder.path("pipe.csv")), O_WRONLY);
    ASSERT_GE(writer, 0);
    kill(static_cast<pid_t>(process.processId()), SIGHUP);
    const QByteArray csv = folder.bytesOf("points.csv");
    EXPECT_EQ(write(writer, csv.constData(), static_cast<std::size_t>(csv.size())), csv.size());
    close(writer);
    const ProgramRun run = endOf(process);
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(folder.bytesOf("out.txt"), jobText());
}

TEST(CommandLineProcess, APipeTakesNoMoreMemoryThanComesOut)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer needs more address space than any limit leaves";
#endif
    const CommandLineFolder folder;
    ASSERT_EQ(mkfifo(qPrintable(folder.path("pipe.csv")), 0600), 0);
    folder.put("pipe.json", folder.bytesOf("job.json").replace("points.csv", "pipe.csv"));
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.setChildProcessModifier([] {
        const rlimit limit = {rlim_t(400) << 20, rlim_t(400) << 20};
        setrlimit(RLIMIT_AS, &limit);
    });
    process.start(QStringLiteral(KAREPORT_PROGRAM), words("render pipe.json -o out.txt"), QIODevice::ReadOnly);
    const int writer = open(qPrintable(folder.path("pipe.csv")), O_WRONLY);
    const QByteArray csv = folder.bytesOf("points.csv");
    EXPECT_EQ(write(writer, csv.constData(), static_cast<std::size_t>(csv.size())), csv.size());
    close(writer);
    const ProgramRun run = endOf(process);
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(folder.bytesOf("out.txt"), jobText());
}

} // namespace
