#include "CommandLine.h"

#include <sys/resource.h>

#include <gtest/gtest.h>

namespace
{

/// Runs the program with so much memory that it can address.
ProgramRun runWithin(const QString &folder, const QStringList &arguments, rlim_t megabytes)
{
    QProcess process;
    process.setWorkingDirectory(folder);
    process.setChildProcessModifier([megabytes] {
        const rlimit limit = {megabytes << 20, megabytes << 20};
        setrlimit(RLIMIT_AS, &limit);
    });
    process.start(QStringLiteral(KAREPORT_PROGRAM), arguments, QIODevice::ReadOnly);
    return endOf(process);
}

/// The program itself needs this much.
constexpr rlim_t ownMegabytes = 200;

TEST(CommandLineMemory, AReportThatDoesNotFitIsNotWrittenInPart)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer needs more address space than any limit leaves";
#endif
    const CommandLineFolder folder;
    folder.put("big.txt", QByteArray("0123456789\r\n").repeated(4'000'000));
    folder.put("out.rep", "kept");
    bool wasRefused = false;
    for (const rlim_t megabytes : {rlim_t(50), rlim_t(100), rlim_t(150), rlim_t(250), rlim_t(350)}) {
        const ProgramRun run = runWithin(folder.path(), words("convert big.txt out.rep"), ownMegabytes + megabytes);
        if (run.status == 0) {
            EXPECT_EQ(folder.bytesOf("out.rep").size(), 3 + 4'000'000 * 13) << megabytes << ": all of it or nothing";
            break;
        }
        wasRefused = true;
        EXPECT_EQ(run.status, 2) << run.all().constData();
        EXPECT_EQ(run.err, "kareport: error: there is not enough memory for this input\n") << megabytes;
        EXPECT_EQ(folder.bytesOf("out.rep"), "kept") << megabytes;
    }
    EXPECT_TRUE(wasRefused);
}

TEST(CommandLineMemory, WhereverItEndsTheProgramSaysSo)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer needs more address space than any limit leaves";
#endif
    struct Row
    {
        QByteArray csv;
        const char *step;
        const char *reason;
    };
    const Row rows[] = {
        {QByteArray("1,2.5\n").repeated(50'000), R"("table": "Points")", "batches of rows, on a thread of their own"},
        {QByteArray(1'000'000, 'x') + ",2.5\n", R"("block": "Point")", "a block of one long line"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("points.csv", "Number,Northing\n" + row.csv);
        folder.put("job.json", folder.bytesOf("job.json").replace(R"("table": "Points")", row.step));
        ASSERT_EQ(folder.run("render job.json -o out.rep").status, 0) << row.reason;
        int refused = 0;
        for (rlim_t megabytes = 60; megabytes < 140; megabytes += 2) {
            folder.put("out.rep", "kept");
            const ProgramRun run = runWithin(folder.path(), words("render job.json -o out.rep"), megabytes);
            if (runWithin(folder.path(), words("--version"), megabytes).status != 0) {
                continue; // the program's libraries have no room
            }
            EXPECT_TRUE(run.status == 0 || run.status == 2) << row.reason << megabytes << run.all().constData();
            if (run.status == 2) {
                ++refused;
                EXPECT_TRUE(run.err.contains("there is not enough memory for ")) << row.reason << run.err.constData();
            }
            EXPECT_EQ(folder.bytesOf("out.rep") == "kept", run.status != 0) << row.reason << megabytes;
        }
        EXPECT_GT(refused, 0) << row.reason;
    }
}

} // namespace
