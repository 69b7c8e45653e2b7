#include "CommandLine.h"

#include <gtest/gtest.h>

#include <functional>

namespace
{

/// A file of the job that is bad in one way.
struct Row
{
    const char *file;
    std::function<QByteArray(QByteArray good)> spoil; ///< none: the file is taken away
    const char *place;                                ///< how the message begins, after the folder
    const char *contains;
    const char *reason;
};

std::function<QByteArray(QByteArray)> as(const QByteArray &bytes)
{
    return [bytes](const QByteArray &) { return bytes; };
}

std::function<QByteArray(QByteArray)> with(const char *before, const QByteArray &after)
{
    return [before, after](QByteArray good) {
        EXPECT_TRUE(good.contains(before)) << before;
        return good.replace(before, after);
    };
}

const Row rows[] = {
    {"job.json", {}, "job.json: error: ", "cannot be read", "a missing job"},
    {"job.json", as(""), "job.json:1:", "a JSON object was expected", "an empty job"},
    {"job.json", as(QByteArray(3000, '\0')), "job.json:1:", "a JSON object was expected", "a binary job"},
    {"job.json", [](const QByteArray &good) { return good.first(good.size() / 2); },
     "job.json:2:", "a JSON object was expected", "a job cut off in the middle"},
    {"job.json", with("\"header\": false", "\"header\": \"no\""),
     "job.json:1:12: error: ", "true or false was expected", "a wrong type"},
    {"job.json", with("\"report\"", "\"steps\": 5, \"report\""), "job.json:4:2: error: ", "\"steps\"",
     "an unknown key"},
    {"job.json", with("\"table\": \"Points\"", "\"table\": \"Pts\""), "job.json:4:38: error: ", "Points",
     "a table that the template does not have"},
    {"job.json", with("\"report\"", "\"header\": true, \"report\""),
     "job.json:4:2: error: ", "the key \"header\" is in line 1 already", "a key twice"},
    {"job.json", with("points.csv", "points.csv\\u0000.gz"), "job.json:3:24: error: ", "without a character 0",
     "a file name that the system would cut"},
    {"job.json", with("\"report\"", "\"title\": " + QByteArray(100000, '[') + ", \"report\""),
     "job.json:4:", "too deeply nested", "a job deeper than a stack"},
    {"points.csv", {}, "job.json:3:24: error: ", "points.csv", "a missing data file, where the job asks for it"},
    {"t.xml", {}, "job.json:2:23: error: ", "t.xml", "a missing template, where the job asks for it"},
    {"t.xml", as(""), "t.xml:1:1: error: ", "ReportTemplate", "an empty template"},
    {"t.xml",
     as(QByteArray("\x7F"
                   "ELF\2\1\1\0\0\0\0\0\0\0\0\0\x3\0\x3E\0",
                   20)
            .repeated(1000)),
     "t.xml:1:1: error: ", "ReportTemplate", "a binary template"},
    {"t.xml", [](const QByteArray &good) { return good.first(400); }, "t.xml:2:1: error: ", "closing tag",
     "a template cut off in the middle"},
    {"t.xml", with("<Name>CONTROL</Name>", "<Name>OTHER</Name>"), "t.xml:", "OTHER, SITE", "no template of that name"},
    {"points.csv", as(""), "points.csv:1:1: error: ", "header row", "an empty data file"},
    {"points.csv", with("1,12.5", "1,12.5,7"), "points.csv:2:8: error: ", "2 were expected", "a ragged row"},
    {"points.csv", with("2A,0", "2A"), "points.csv:3:", "2 were expected", "a ragged row, the last one"},
    {"points.csv", with("12.5", "12,5"), "points.csv:2:6: error: ", "2 were expected", "a decimal comma"},
    {"points.csv", with("12.5", "12.5m"), "points.csv:2:3: error: ", "\"12.5m\"", "a bad number"},
    {"points.csv", with("2A,0", "2\"A,0"), "points.csv:3:2: error: ", "quote", "a stray quote"},
    {"points.csv", with("2A,0", "\"2A,0"), "points.csv:3:1: error: ", "closing quote", "a quote that is not closed"},
    {"points.csv", with("2A,0", "\xC4,0"), "points.csv:3:1: error: ", "UTF-8", "a wrong encoding"},
    {"points.csv", as(QByteArray("\xFF\xFEN\0u\0m\0", 8)), "points.csv:1:", "expected", "UTF-16"},
    {"points.csv", as(QByteArray(5 << 20, 'x')), "points.csv:1:1: error: ", "longer", "an endless line"},
    {"points.csv", with("2A,0\n", QByteArray(5 << 20, '1')), "points.csv:3:1: error: ", "longer",
     "an endless line after good ones"},
};

TEST(CommandLineInput, WhatIsWrongIsSaidInOneSentenceAndNothingIsWritten)
{
    for (const Row &row : rows) {
        CommandLineFolder folder;
        const QByteArray good = folder.bytesOf(row.file);
        if (row.spoil) {
            folder.put(row.file, row.spoil(good));
        } else {
            ASSERT_TRUE(QFile::remove(folder.path(row.file)));
        }
        folder.put("kept.rep", "kept");
        folder.put("kept.txt", "kept too");
        const QStringList names = folder.names();
        const ProgramRun run = folder.run("render job.json -o kept.rep -o kept.txt -o new.txt -o -");
        EXPECT_EQ(run.status, 2) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.reason;
        EXPECT_EQ(run.err.count('\n'), 1) << row.reason << ": one sentence\n" << run.err.constData();
        QByteArray message = run.err;
        message.replace(folder.path().toUtf8() + '/', "");
        EXPECT_TRUE(message.startsWith(row.place)) << row.reason << "\n" << message.constData();
        EXPECT_TRUE(message.contains(row.contains)) << row.reason << "\n" << message.constData();
        EXPECT_LT(message.size(), 400) << row.reason;
        EXPECT_EQ(folder.names(), names) << row.reason;
        EXPECT_EQ(folder.bytesOf("kept.rep"), "kept") << row.reason;
        EXPECT_EQ(folder.bytesOf("kept.txt"), "kept too") << row.reason;
    }
}

TEST(CommandLineInput, ASetKeyOfManyStepsIsAnErrorOfTheCommandLine)
{
    const CommandLineFolder folder;
    const QString key = QStringList(50000, QStringLiteral("a")).join(u'.');
    const ProgramRun run =
        runProgram(folder.path(), {QStringLiteral("render"), QStringLiteral("job.json"), QStringLiteral("--set"),
                                   key + QStringLiteral("=1"), QStringLiteral("-o"), QStringLiteral("-")});
    EXPECT_EQ(run.status, 1) << run.all().constData();
    EXPECT_EQ(run.out, "");
    EXPECT_TRUE(run.err.contains("at most 100 were expected")) << run.err.constData();
    EXPECT_EQ(run.err.count('\n'), 1);
    EXPECT_LT(run.err.size(), 400);
}

TEST(CommandLineInput, BlanksAroundNamesOfColumnsLoseNoValue)
{
    const CommandLineFolder folder;
    const ProgramRun plain = folder.run("render job.json -o -");
    ASSERT_EQ(plain.status, 0) << plain.all().constData();
    QByteArray points = folder.bytesOf("points.csv");
    points.replace(0, points.indexOf('\n'), points.first(points.indexOf('\n')).replace(",", " ,\xC2\xA0"));
    folder.put("points.csv", points);
    EXPECT_EQ(folder.run("render job.json -o -").out, plain.out);
}

TEST(CommandLineInput, TheShortFormNamesTheFileThatIsWrong)
{
    struct ShortRow
    {
        const char *line;
        const char *begins;
        const char *contains;
        const char *reason;
    };
    constexpr ShortRow shortRows[] = {
        {"--template none.xml --name CONTROL --table Points --data points.csv", "", "none.xml", "no template"},
        {"--template t.xml --name NONE --table Points --data points.csv", "t.xml:", "CONTROL, SITE", "no such name"},
        {"--template t.xml --name CONTROL --table None --data points.csv", "", "\"None\"", "no such table"},
        {"--template t.xml --name CONTROL --block Points --data points.csv", "", "one of Point ", "no such block"},
        {"--template t.xml --name CONTROL --table Points --data none.csv", "", "none.csv", "no data"},
        {"--template t.xml --name CONTROL --table Points --data bad.csv", "bad.csv:2:3: error: ", "\"x\"",
         "a bad cell"},
        {"--template t.xml --name CONTROL --block Point --data empty.csv", "", "empty.csv", "a block of no rows"},
    };
    for (const ShortRow &row : shortRows) {
        const CommandLineFolder folder;
        folder.put("bad.csv", "Number,Northing\n1,x\n");
        folder.put("empty.csv", "Number,Northing\n");
        folder.put("kept.rep", "kept");
        const ProgramRun run = folder.run(words("render -o kept.rep") + words(row.line));
        EXPECT_EQ(run.status, 2) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.reason;
        EXPECT_EQ(run.err.count('\n'), 1) << row.reason;
        QByteArray message = run.err;
        message.replace(folder.path().toUtf8() + '/', "");
        EXPECT_TRUE(message.startsWith(row.begins)) << row.reason << "\n" << message.constData();
        EXPECT_FALSE(message.startsWith(':')) << row.reason << "\n" << message.constData();
        EXPECT_TRUE(message.simplified().append(' ').contains(row.contains)) << row.reason << "\n"
                                                                             << message.constData();
        EXPECT_EQ(folder.bytesOf("kept.rep"), "kept") << row.reason;
    }
}

} // namespace
