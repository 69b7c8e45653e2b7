#include "CommandLine.h"
#include "GeoPackageFile.h"
#include "TestSize.h"

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

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
        const auto step = static_cast<rlim_t>(testSize(5, 2));
        for (rlim_t megabytes = 60; megabytes < 140; megabytes += step) {
            folder.put("out.rep", "kept");
            const ProgramRun run = runWithin(folder.path(), words("render job.json -o out.rep"), megabytes);
            if (run.status != 0 && runWithin(folder.path(), words("--version"), megabytes).status != 0) {
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

/// The peak of the program's memory for a job in a folder, in kilobytes; -1 when it fails.
long peakOf(const QString &folder, const char *job, bool isCheck = false)
{
    const QByteArray program = KAREPORT_PROGRAM;
    const QByteArray path = folder.toUtf8();
    const pid_t child = fork();
    if (child == 0) {
        if (chdir(path.constData()) == 0) {
            if (isCheck) {
                execl(program.constData(), program.constData(), "check", job, "--quiet", nullptr);
            }
            execl(program.constData(), program.constData(), "render", job, "-o", "out.rep", "--quiet", nullptr);
        }
        _exit(127);
    }
    int status = 0;
    rusage usage = {};
    return wait4(child, &status, 0, &usage) == child && status == 0 ? usage.ru_maxrss : -1;
}

TEST(CommandLineMemory, DoesNotGrowWithTheRows)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    struct Row
    {
        const char *set;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("csv": "points.csv")", "a file that is mapped"},
        {R"("csv": "points.csv", "encoding": "windows-1252")", "a file that is converted"},
        {R"("json": "points.json")", "JSON lines"},
        {R"("sqlite": "points.db", "table": "points")", "a database"},
    };
    const CommandLineFolder folder;
    const auto putData = [&folder](int count) {
        QByteArray csv = "Number,Northing\n";
        QByteArray json;
        for (int i = 0; i < count; ++i) {
            const QByteArray number = QByteArray::number(1'000'000'000 + i);
            csv += number + ",12345.678000000000000000000000000000\n";
            json += "{\"Number\":\"" + number + "\",\"Northing\":12345.678000000000000000}\n";
        }
        folder.put("points.csv", csv);
        folder.put("points.json", json);
        QFile::remove(folder.path("points.db"));
        geo::runSql(
            folder.path("points.db"),
            "CREATE TABLE points (Number TEXT, Northing REAL, rest TEXT); WITH RECURSIVE i(n) AS (SELECT 1 UNION ALL "
            "SELECT n + 1 FROM i WHERE n < " +
                QByteArray::number(count) +
                ") INSERT INTO points SELECT 1000000000 + n, n / 10.0, 'something that is not read' FROM i");
    };
    const auto peaks = [&](int count) {
        putData(count);
        std::vector<long> found;
        for (const Row &row : rows) {
            folder.put("job.json", QByteArray(R"({"page": {"linesPerPage": 72, "charsPerRow": 80},
                "template": {"file": "t.xml", "name": "CONTROL"}, "report": [{"table": "Points", "data": "p"}],
                "data": {"p": {)") + row.set +
                                       "}}}");
            found.push_back(peakOf(folder.path(), "job.json"));
        }
        return found;
    };
    const std::vector<long> few = peaks(40'000);
    const std::vector<long> many = peaks(400'000); // files of 19 MB
    constexpr long mostKilobytes = 9 * 1024; // the piece that memory is given back in, and what it is read ahead by
    for (std::size_t i = 0; i < std::size(rows); ++i) {
        ASSERT_GT(few[i], 0) << rows[i].reason;
        ASSERT_GT(many[i], 0) << rows[i].reason;
        EXPECT_LT(many[i] - few[i], mostKilobytes) << rows[i].reason << ": " << few[i] << " and " << many[i];
    }
}

TEST(CommandLineMemory, ACheckDoesNotGrowWithTheRows)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const CommandLineFolder folder;
    const auto peak = [&](int rows, const char *steps) {
        folder.put("points.csv", "Number,Northing\n" + QByteArray("1000000001,12.5\n").repeated(rows));
        folder.put("job.json", QByteArray(R"({"page": {"linesPerPage": 72, "charsPerRow": 80}, "header": false,
            "template": {"file": "t.xml", "name": "CONTROL"}, "data": {"p": {"csv": "points.csv"}}, "report": [)") +
                                   steps + "]}");
        return peakOf(folder.path(), "job.json", true);
    };
    constexpr long mostKilobytes = 9 * 1024;
    for (const char *steps :
         {R"({"table": "Points", "data": "p"})", R"({"table": "Points", "data": "p"}, {"clear": true})"})
    {
        const long few = peak(40'000, steps);
        const long many = peak(400'000, steps);
        ASSERT_GT(few, 0);
        ASSERT_GT(many, 0);
        EXPECT_LT(many - few, mostKilobytes) << steps << ": " << few << " and " << many;
    }
}

} // namespace
