#include "CommandLine.h"
#include "GeoPackageFile.h"
#include "PrivatePostgres.h"
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

TEST(CommandLineMemory, ATemplateOf200MegabytesIsRefusedUnread)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer needs more address space than any limit leaves";
#endif
    constexpr rlim_t megabytes = ownMegabytes + 100; // there is no room for the file
    for (const char *line :
         {"render job.json -o kept.rep", "templates t.xml", "templates t.xml --name CONTROL", "check t.xml"})
    {
        const CommandLineFolder folder;
        folder.put("kept.rep", "kept");
        QFile big(folder.path("t.xml"));
        ASSERT_TRUE(big.resize(qint64(200) << 20));
        const ProgramRun run = runWithin(folder.path(), words(line), megabytes);
        EXPECT_EQ(run.status, 2) << line << "\n" << run.all().constData();
        const QByteArray said = run.out + run.err;
        EXPECT_TRUE(said.contains("t.xml:1:1: error: ")) << said.constData();
        EXPECT_TRUE(said.contains("200 MB")) << said.constData();
        EXPECT_TRUE(said.contains("expected")) << said.constData();
        EXPECT_EQ(said.count('\n'), 1) << said.constData();
        EXPECT_EQ(folder.bytesOf("kept.rep"), "kept");
    }
}

/// The peak of the memory of a command of the shell in a folder, in kilobytes; -1 when it fails. "kareport" is the program.
long peakOfCommand(const QString &folder, QByteArray command)
{
    command.replace("kareport", KAREPORT_PROGRAM);
    const QByteArray path = folder.toUtf8();
    const pid_t child = fork();
    if (child == 0) {
        if (chdir(path.constData()) == 0) {
            execl("/bin/sh", "sh", "-c", command.constData(), nullptr);
        }
        _exit(127);
    }
    int status = 0;
    rusage usage = {};
    return wait4(child, &status, 0, &usage) == child && status == 0 ? usage.ru_maxrss : -1;
}

/// The same of the program for a job.
long peakOf(const QString &folder, const char *job, bool isCheck = false)
{
    return peakOfCommand(folder, isCheck ? QByteArray("kareport check ") + job + " --quiet"
                                         : QByteArray("kareport render ") + job + " -o out.rep --quiet");
}

/// A job that writes a data set through the table.
QByteArray jobOf(const char *set)
{
    return QByteArray(R"({"page": {"linesPerPage": 72, "charsPerRow": 80},
        "template": {"file": "t.xml", "name": "CONTROL"}, "report": [{"table": "Points", "data": "p"}],
        "data": {"p": {)") +
           set + "}}}";
}

/// @param name  that every number begins with @param perNumber  how many rows have the same
QByteArray manyRows(int count, const QByteArray &name = {}, int perNumber = 1)
{
    QByteArray csv = "Number,Northing\n";
    for (int i = 0; i < count; ++i) {
        csv += name + QByteArray::number(1'000'000'000 + i / perNumber) + ",12345.678000000000000000000000000000\n";
    }
    return csv;
}

constexpr int fewRows = 40'000;
constexpr int moreRows = 360'000;
constexpr long mostKilobytes = 9 * 1024; // the piece that memory is given back in, and what it is read ahead by

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
        QByteArray json;
        for (int i = 0; i < count; ++i) {
            const QByteArray number = QByteArray::number(1'000'000'000 + i);
            json += "{\"Number\":\"" + number + "\",\"Northing\":12345.678000000000000000}\n";
        }
        folder.put("points.csv", manyRows(count));
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
            folder.put("job.json", jobOf(row.set));
            found.push_back(peakOf(folder.path(), "job.json"));
        }
        return found;
    };
    const std::vector<long> few = peaks(40'000);
    const std::vector<long> many = peaks(400'000); // files of 19 MB
    for (std::size_t i = 0; i < std::size(rows); ++i) {
        ASSERT_GT(few[i], 0) << rows[i].reason;
        ASSERT_GT(many[i], 0) << rows[i].reason;
        EXPECT_LT(many[i] - few[i], mostKilobytes) << rows[i].reason << ": " << few[i] << " and " << many[i];
    }
}

TEST(CommandLineMemory, DoesNotGrowWithTheRowsOfAPipe)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const CommandLineFolder folder;
    for (const char *set : {R"("csv": "-")", R"("csv": "-", "encoding": "latin-1")"}) {
        folder.put("job.json", jobOf(set));
        const auto peak = [&folder](int rows) {
            folder.put("points.csv", manyRows(rows));
            return peakOfCommand(folder.path(), "cat points.csv | kareport render job.json -o out.rep --quiet");
        };
        const long few = peak(fewRows);
        const long many = peak(fewRows + moreRows);
        ASSERT_GT(few, 0) << set;
        ASSERT_GT(many, 0) << set;
        EXPECT_LT(many - few, mostKilobytes) << set << ": " << few << " and " << many;
    }
}

TEST(CommandLineMemory, DoesNotGrowWithTheRowsOfAnyOutput)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const CommandLineFolder folder;
    folder.put("job.json", jobOf(R"("csv": "points.csv")"));
    for (const char *output : {"-o out.csv", "-o out.jsonl", "-o out.html", "-o out.xlsx", "-o - --as csv >out.csv"}) {
        const auto peak = [&](int rows) {
            folder.put("points.csv", manyRows(rows, QByteArray(60, 'n'))); // the least of the outputs has 16 MB more
            return peakOfCommand(folder.path(), QByteArray("kareport render job.json --quiet ") + output);
        };
        const long few = peak(20'000);
        const long many = peak(220'000);
        ASSERT_GT(few, 0) << output;
        ASSERT_GT(many, 0) << output;
        EXPECT_LT(many - few, mostKilobytes) << output << ": " << few << " and " << many;
    }
}

TEST(CommandLineMemory, OfTotalsUnderRowsDoesNotGrow)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const CommandLineFolder folder;
    folder.put("t.xml", controlTemplates().replace("<Sort></Sort>", "")); // the step sorts
    const auto peak = [&folder](int rows, const QByteArray &keys) {
        folder.put("points.csv", manyRows(rows, {}, 100));
        folder.put("job.json",
                   jobOf(R"("csv": "points.csv")").replace(R"("data": "p"})", R"("data": "p", )" + keys + "}"));
        return peakOf(folder.path(), "job.json");
    };
    const QByteArray totals = R"("totals": [{"label": "{count}", "sum": "Northing"}],
        "pageTotals": [{"label": "{mean:Northing}", "sum": "Northing"}])";
    const long few = peak(fewRows, totals);
    const long many = peak(fewRows + moreRows, totals);
    ASSERT_GT(few, 0);
    ASSERT_GT(many, 0);
    EXPECT_LT(many - few, mostKilobytes) << few << " and " << many;
    // Groups are of sorted rows: with totals under them they take what the sorting takes.
    const QByteArray sort = R"("sort": "Number")";
    const long sorted = peak(fewRows + moreRows, sort);
    const long grouped = peak(fewRows + moreRows, sort + R"(, "groups": [{"by": "Number", "heading": "{Number}",
        "totals": [{"label": "{count}", "mean": "Northing"}]}], )" +
                                                      totals);
    ASSERT_GT(sorted, 0);
    ASSERT_GT(grouped, 0);
    EXPECT_LT(grouped - sorted, mostKilobytes) << sorted << " and " << grouped;
}

TEST(CommandLineMemory, OfASortedTableIsThatOfItsKeysAndPlaces)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const CommandLineFolder folder;
    folder.put("t.xml",
               controlTemplates().replace("<Sort></Sort>", "<Sort><VariableName>Number</VariableName></Sort>"));
    constexpr long mostBytes = 260;           // a row, with a short text for its key
    for (const bool isPipe : {false, true}) { // a pipe cannot be read twice: its rows go to a file
        folder.put("job.json", jobOf(isPipe ? R"("csv": "-")" : R"("csv": "points.csv")"));
        const auto peak = [&](int rows) {
            folder.put("points.csv", manyRows(rows));
            const QByteArray command = "kareport render job.json -o out.rep --quiet";
            return peakOfCommand(folder.path(), isPipe ? "cat points.csv | " + command : command);
        };
        const long few = peak(fewRows);
        const long many = peak(fewRows + moreRows);
        ASSERT_GT(few, 0) << isPipe;
        ASSERT_GT(many, 0) << isPipe;
        EXPECT_LT(many - few, moreRows / 1024 * mostBytes + mostKilobytes) << isPipe << ": " << few << " and " << many;
    }
}

TEST(CommandLineMemory, DoesNotGrowWithTheRowsOfAServer)
{
#if defined(__SANITIZE_ADDRESS__)
    GTEST_SKIP() << "the address sanitizer keeps what was freed";
#endif
    const PrivatePostgres server;
    if (!server.isRunning()) {
        GTEST_SKIP() << "no server";
    }
    const CommandLineFolder folder;
    const auto peak = [&](int rows) {
        const QByteArray set = R"("postgresql": ")" + server.connection().toUtf8() +
                               R"(", "query": "SELECT i AS number, i / 10.0 AS northing FROM generate_series(1, )" +
                               QByteArray::number(rows) + R"() i")";
        folder.put("job.json", jobOf(set.constData()));
        return peakOf(folder.path(), "job.json");
    };
    const long few = peak(fewRows);
    const long many = peak(fewRows + moreRows);
    ASSERT_GT(few, 0);
    ASSERT_GT(many, 0);
    EXPECT_LT(many - few, mostKilobytes) << few << " and " << many;
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
