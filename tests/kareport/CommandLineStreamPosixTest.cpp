#include "CommandLine.h"

#include <algorithm>
#include <csignal>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <utility>

namespace
{

/// A job of rows that make about 40 MB of text.
class LongJob : public CommandLineFolder
{
public:
    explicit LongJob(const char *output)
    {
        QByteArray csv = "Number,Northing\n";
        for (int i = 0; i < 1'500'000; ++i) {
            csv += "1,2.5\n";
        }
        put("points.csv", csv);
        put("job.json", bytesOf("job.json").replace("]}\n", QByteArray("], \"output\": [\"") + output + "\"]}"));
    }
};

/// The largest percentage that the program has shown.
int furthestIn(const QByteArray &err)
{
    int furthest = 0;
    for (const QByteArray &word : err.simplified().split(' ')) {
        furthest = std::max(furthest, word.toInt());
    }
    return furthest;
}

TEST(CommandLineStream, AFullDiskLeavesTheOldFileAndIsSaidAtOnce)
{
    const LongJob folder("out.rep");
    folder.put("out.rep", "kept");
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.setChildProcessModifier([] {
        const rlimit limit = {1 << 20, 1 << 20};
        setrlimit(RLIMIT_FSIZE, &limit);
    });
    process.start(QStringLiteral(KAREPORT_PROGRAM), words("render job.json --progress"), QIODevice::ReadOnly);
    ASSERT_TRUE(process.waitForFinished(60'000));
    const QByteArray err = process.readAllStandardError();
    EXPECT_EQ(process.exitCode(), 3) << err.constData();
    EXPECT_TRUE(err.contains("out.rep\" could not be written: File too large")) << err.constData();
    EXPECT_LT(furthestIn(err), 50) << "the rest of the rows was not read for nothing";
    EXPECT_EQ(folder.bytesOf("out.rep"), "kept");
    EXPECT_EQ(folder.names(), words("job.json out.rep points.csv t.xml"));
}

TEST(CommandLineStream, WhatIsNotAFileGetsTheWholeReportOrNothing)
{
    const CommandLineFolder folder;
    ASSERT_EQ(mkfifo(qPrintable(folder.path("out.txt")), 0600), 0);
    folder.put("points.csv", "Number,Northing\n1,x\n");
    folder.put("job.json", folder.bytesOf("job.json").replace("]}\n", "], \"output\": [\"out.txt\"]}"));
    // Nothing reads the pipe: opening it would never return.
    const ProgramRun run = folder.run("render job.json");
    EXPECT_EQ(run.status, 2) << run.all().constData();
}

TEST(CommandLineStream, StoppedInTheMiddleTheOldFileStays)
{
    const LongJob folder("out.rep");
    folder.put("out.rep", "kept");
    for (const int signal : {SIGINT, SIGTERM, SIGKILL}) {
        QProcess process;
        process.setWorkingDirectory(folder.path());
        process.setChildProcessModifier([] { std::signal(SIGINT, SIG_DFL); }); // a background job has it switched off
        process.start(QStringLiteral(KAREPORT_PROGRAM), words("render job.json --progress"), QIODevice::ReadOnly);
        QByteArray err;
        // Until the first rows were read, which shows.
        process.setReadChannel(QProcess::StandardError);
        while (!err.contains('%') && process.waitForReadyRead(30'000)) {
            err += process.readAllStandardError();
        }
        ASSERT_GT(process.processId(), 0) << err.constData();
        kill(static_cast<pid_t>(process.processId()), signal);
        const ProgramRun run = endOf(process);
        EXPECT_EQ(run.signal, signal) << "as the shell expects that asks for the end of its loop";
        if (signal != SIGKILL) {
            EXPECT_TRUE((err + run.err).contains("stopped; no")) << signal << run.err.constData();
        }
        EXPECT_EQ(folder.bytesOf("out.rep"), "kept") << signal;
        EXPECT_EQ(folder.names(), words("job.json out.rep points.csv t.xml")) << signal;
    }
}

TEST(CommandLineStream, ACsvThatIsCutShortMeanwhileFailsItsJobAlone)
{
    const LongJob folder("out.rep"); // of many rows
    folder.put("cut.json", folder.bytesOf("job.json").replace("out.rep", "cut.rep"));
    folder.put("cut.rep", "kept");
    folder.put("few.csv", "Number,Northing\n1,12.5\n2A,0\n");
    for (const char *name : {"first", "last"}) {
        folder.put(
            (QByteArray(name) + ".json").constData(),
            folder.bytesOf("job.json").replace("points.csv", "few.csv").replace("out.rep", QByteArray(name) + ".rep"));
    }
    QProcess process;
    process.setWorkingDirectory(folder.path());
    process.start(QStringLiteral(KAREPORT_PROGRAM), words("render first.json cut.json last.json --progress"),
                  QIODevice::ReadOnly);
    process.setReadChannel(QProcess::StandardError);
    QByteArray err;
    const auto isReading = [&err] {
        const qsizetype second = err.indexOf("2/3");
        return second >= 0 && furthestIn(err.sliced(second)) > 33; // the first job was a third of the work
    };
    while (!isReading() && process.waitForReadyRead(30'000)) {
        err += process.readAllStandardError();
    }
    // What has not been read yet is not there any more.
    ASSERT_TRUE(QFile::resize(folder.path("points.csv"), 1000));
    ProgramRun run = endOf(process);
    run.err.prepend(err);
    EXPECT_EQ(run.status, 2) << run.all().constData();
    EXPECT_TRUE(run.err.contains("points.csv: error: the file was cut short while it was read")) << run.err.constData();
    EXPECT_TRUE(run.err.contains("2 of 3 jobs made, 1 failed")) << run.err.constData();
    EXPECT_EQ(folder.bytesOf("cut.rep"), "kept");
    EXPECT_EQ(folder.bytesOf("first.rep"), jobReport());
    EXPECT_EQ(folder.bytesOf("last.rep"), jobReport()) << "the rest of the batch is made";
}

/// A pipe for the standard output of a program, whose reader is here.
class OutputPipe
{
public:
    OutputPipe() { EXPECT_EQ(pipe(ends_), 0); }
    ~OutputPipe()
    {
        leaveToProgram();
        close(ends_[0]);
    }
    OutputPipe(const OutputPipe &) = delete;
    OutputPipe &operator=(const OutputPipe &) = delete;

    /// Starts the program. @param isIgnored  whether the caller has switched the signal off
    void start(QProcess &process, const QString &folder, const char *line, bool isIgnored) const
    {
        process.setWorkingDirectory(folder);
        process.setChildProcessModifier([this, isIgnored] {
            dup2(ends_[1], STDOUT_FILENO);
            close(ends_[0]);
            close(ends_[1]);
            std::signal(SIGPIPE, isIgnored ? SIG_IGN : SIG_DFL);
        });
        process.start(QStringLiteral(KAREPORT_PROGRAM), words(line), QIODevice::ReadOnly);
    }
    /// The end to write to is then the program's alone.
    void leaveToProgram() { close(std::exchange(ends_[1], -1)); }
    /// The next line with its end; as much of it as comes.
    QByteArray readLine() const
    {
        QByteArray line;
        for (char next = 0; next != '\n' && read(ends_[0], &next, 1) == 1;) {
            line += next;
        }
        return line;
    }

private:
    int ends_[2] = {-1, -1};
};

/// Runs the program with a pipe for standard output, whose reader ends as soon as a part of the work is done.
ProgramRun runUntilReaderGoes(const QString &folder, const char *line, bool isIgnored)
{
    QProcess process;
    QByteArray err;
    {
        const OutputPipe output;
        output.start(process, folder, line, isIgnored);
        process.setReadChannel(QProcess::StandardError);
        while (furthestIn(err) == 0 && process.waitForReadyRead(30'000)) {
            err += process.readAllStandardError();
        }
    }
    ProgramRun run = endOf(process);
    run.err.prepend(err);
    return run;
}

TEST(CommandLineStream, TheWorkEndsSoonAfterTheReaderOfStandardOutputGoes)
{
    const LongJob folder("-");
    for (const bool isIgnored : {false, true}) {
        const ProgramRun run = runUntilReaderGoes(folder.path(), "render job.json --progress", isIgnored);
        EXPECT_EQ(run.signal, isIgnored ? 0 : SIGPIPE) << run.all().constData();
        EXPECT_EQ(run.status, isIgnored ? 3 : -1) << "where the caller has switched the signal off";
        EXPECT_GT(furthestIn(run.err), 0);
        EXPECT_LT(furthestIn(run.err), 60) << "the rest of the rows was not read for nothing";
    }
}

TEST(CommandLineStream, AReaderThatLeavesAfterTheFirstLineEndsTheWork)
{
    const LongJob folder("-");
    for (const char *line : {"render job.json -o - -o late.rep", "render job.json --as rep -o - -o late.txt"}) {
        for (const bool isIgnored : {false, true}) {
            QProcess process;
            {
                OutputPipe output;
                output.start(process, folder.path(), line, isIgnored);
                output.leaveToProgram();
                EXPECT_TRUE(output.readLine().contains("\xC3\xA4")) << "the report's first line";
            }
            const ProgramRun run = endOf(process);
            EXPECT_EQ(run.signal, isIgnored ? 0 : SIGPIPE) << run.err.constData();
            EXPECT_EQ(run.status, isIgnored ? 3 : -1) << run.err.constData();
            EXPECT_EQ(run.err, "") << "as other programs end";
            EXPECT_EQ(folder.names(), words("job.json points.csv t.xml")) << "nothing else is made for it";
        }
    }
}

} // namespace
