#include "CommandLine.h"

#include "JobReader.h"
#include "LeastSize.h"
#include "SizeLimit.h"

#include <gtest/gtest.h>

#include <memory>

namespace
{

using kareport::sizeFromText;

TEST(CommandLineLimit, ASizeIsANumberOfBytes)
{
    struct Row
    {
        const char *text;
        std::optional<qint64> bytes;
    };
    const Row rows[] = {
        {"1", 1},
        {"500", 500},
        {"64K", 64 << 10},
        {"64k", 64 << 10},
        {"10M", 10 << 20},
        {"2G", qint64(2) << 30},
        {"8589934591G", qint64(8589934591) << 30},
        {"8589934592G", std::nullopt}, // one more than a number holds
        {"", std::nullopt},
        {"0", std::nullopt},
        {"K", std::nullopt},
        {"-1", std::nullopt},
        {"+1", std::nullopt},
        {"1.5M", std::nullopt},
        {" 1", std::nullopt},
        {"1 M", std::nullopt},
        {"1MB", std::nullopt},
        {"1T", std::nullopt},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(sizeFromText(QString::fromUtf8(row.text)), row.bytes) << row.text;
    }
    EXPECT_EQ(CommandLineFolder().run("render job.json --limit 10Q").status, 1);
}

/// A job without header and data, on pages of 10 lines.
QByteArray job(const char *steps, const char *front = R"("header": false, )")
{
    return QByteArray("{") + front + R"("page": {"linesPerPage": 10, "charsPerRow": 80}, "report": [)" + steps + "]}";
}

qint64 leastSizeOf(const QString &job)
{
    const auto source = kareport::JsonSource::read(job);
    return kareport::leastSize(std::get<kareport::Job>(kareport::readJob(std::get<kareport::JsonSource>(source))));
}

TEST(CommandLineLimit, TheLeastSizeIsTheSizeOfAReportWithoutData)
{
    struct Row
    {
        const char *steps;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "nothing"},
        {R"({"lineFeed": 1000}, {"lineFeed": -5})", "blank lines"},
        {R"({"line": "abc"}, {"line": "äöü漢", "after": 0}, {"line": "x", "before": 3, "after": 4})", "lines"},
        {R"({"line": "a", "before": 9}, {"line": "b", "before": 8, "after": 9}, {"line": "c", "after": -1})",
         "blank lines that a page has no room for"},
        {R"({"newPage": -1}, {"newPage": -1}, {"line": "a"}, {"newPage": 8}, {"newPage": 7}, {"newPage": 100})",
         "pages"},
        {R"({"line": "a\nb\r\nc"}, {"newPage": 5}, {"newPage": -1})", "line ends in a text"},
        {R"({"lineFeed": 25}, {"newPage": -1}, {"line": "a"})", "beyond the page's end"},
        {R"({"lineFeed": 500}, {"clear": true}, {"line": "a"}, {"newPage": -1})", "what was thrown away"},
        {R"({"heading": "x\ny", "before": 2, "after": 3}, {"line": "a"}, {"newPage": -1})",
         "a heading without a header"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("job.json", job(row.steps));
        const ProgramRun run = folder.run("render job.json");
        EXPECT_EQ(run.status, 0) << row.reason << run.all().constData();
        EXPECT_EQ(leastSizeOf(folder.path("job.json")), run.out.size()) << row.reason;
        // With headers only their names are not known exactly.
        folder.put("job.json", job(row.steps, ""));
        const ProgramRun headed = folder.run("render job.json");
        const qint64 least = leastSizeOf(folder.path("job.json"));
        EXPECT_LE(least, headed.out.size()) << row.reason;
        EXPECT_GE(least, headed.out.size() - 100 * headed.out.count("Page:")) << row.reason;
    }
}

TEST(CommandLineLimit, TheLeastSizeIsNeverTooLargeWithData)
{
    constexpr const char *steps[] = {
        R"({"table": "Points", "data": "p"}, {"newPage": 5}, {"newPage": -1}, {"line": "a", "before": 9})",
        R"({"heading": "long heading"}, {"table": "Points", "data": "p", "before": 9}, {"newPage": -1}, {"newPage": -1})",
        R"({"line": "a"}, {"block": "Point", "data": "p"}, {"line": "b", "before": 3}, {"newPage": 1}, {"lineFeed": 3})",
    };
    for (const char *step : steps) {
        const CommandLineFolder folder;
        folder.put("job.json", job(step, R"("template": {"file": "t.xml", "name": "CONTROL"},
            "data": {"p": {"csv": "points.csv"}}, )"));
        const ProgramRun run = folder.run("render job.json");
        EXPECT_EQ(run.status, 0) << run.all().constData();
        const qint64 least = leastSizeOf(folder.path("job.json"));
        EXPECT_LE(least, run.out.size()) << step;
        EXPECT_GT(least, 0) << step;
    }
}

/// A job of little text that becomes much of it.
QByteArray shortJob()
{
    return job(QByteArray(R"({"lineFeed": 1000000},)").repeated(120).chopped(1).constData());
}

TEST(CommandLineLimit, ALargeReportIsSaidBeforeItIsMadeAndRefusedByALimit)
{
    const CommandLineFolder folder;
    folder.put("job.json", shortJob());
    ProgramRun run = folder.run("render job.json -o /dev/null --as text");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.err, "kareport: the report will have at least 114.4 MB\n");
    folder.put("out.rep", "kept");
    run = folder.run("render job.json -o out.rep --limit 100M");
    EXPECT_EQ(run.status, 3) << run.all().constData();
    EXPECT_EQ(run.err,
              "kareport: nothing was written: the report has at least 114.4 MB, more than the limit of 100.0 MB\n");
    EXPECT_EQ(folder.bytesOf("out.rep"), "kept");
}

TEST(CommandLineLimit, WhatShowsOnlyWhileItIsMadeIsRefusedThen)
{
    struct Row
    {
        const char *line;
        int status;
        QByteArray out;
        const char *reason;
    };
    const QByteArray size = QByteArray::number(jobText().size());
    const QByteArray less = QByteArray::number(jobText().size() - 1);
    const Row rows[] = {
        {"render job.json -o out.txt --limit ", 0, "", "exactly as much as is allowed"},
        {"render job.json -o - --limit ", 0, jobText(), "to standard output"},
        {"render job.json -o out.rep --limit ", 3, "", "a report file has more bytes than its text"},
        {"render job.json -o out.txt -o other.txt --limit ", 0, "", "each output counts for itself"},
        {"render job.json -o out.txt -o - --limit ", 0, jobText(), "both"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("out.rep", "kept");
        folder.put("out.txt", "kept");
        ProgramRun run = folder.run((row.line + size).constData());
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, row.out) << row.reason;
        EXPECT_EQ(folder.bytesOf("out.rep"), "kept") << row.reason;
        folder.put("out.txt", "kept");
        run = folder.run((row.line + less).constData());
        EXPECT_EQ(run.status, 3) << row.reason;
        EXPECT_EQ(run.out, "") << "nothing of it: " << row.reason;
        EXPECT_TRUE(run.err.contains("\" was not written: it would have more than ")) << run.err.constData();
        EXPECT_EQ(folder.bytesOf("out.txt"), "kept") << row.reason;
        EXPECT_EQ(folder.bytesOf("out.rep"), "kept") << row.reason;
    }
}

TEST(CommandLineLimit, TheWorkEndsWhereTheLimitIsPassed)
{
    // A mistake far down shows that no more is made.
    for (const char *outputs : {"-o out.txt", "-o out.txt -o out.rep", "-o out.pdf"}) {
        const CommandLineFolder folder;
        folder.put("points.csv", "Number,Northing\n" + QByteArray("1,2.5\n").repeated(100'000) + "1,x\n");
        const ProgramRun run = folder.run((QByteArray("render job.json --limit 100K ") + outputs).constData());
        EXPECT_EQ(run.status, 3) << run.all().constData();
        EXPECT_EQ(folder.names(), words("job.json points.csv t.xml")) << outputs;
    }
}

TEST(CommandLineLimit, OfABatchOnlyTheLargeJobIsRefused)
{
    const CommandLineFolder folder;
    folder.put("large.json", shortJob());
    const ProgramRun run = folder.run("render large.json job.json -o {}.txt --limit 1M");
    EXPECT_EQ(run.status, 3) << run.all().constData();
    EXPECT_EQ(folder.bytesOf("job.txt"), jobText());
}

} // namespace
