#include "CommandLine.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <gtest/gtest.h>

// The short form with data of any habit, data and jobs from standard input, and what is noted on them.

namespace
{

const char *const shortForm = "render -t t.xml -n CONTROL --table Points --set header=false ";

/// The rows of the table: without a header, no heading is over them.
QByteArray tableText()
{
    return "1    |   12.500\n2A   |    0.000\n";
}

/// A text of ASCII alone as UTF-16 with its mark.
QByteArray wideText(const QByteArray &text)
{
    QByteArray wide = "\xFF\xFE";
    for (const char byte : text) {
        wide += byte;
        wide += '\0';
    }
    return wide;
}

TEST(CommandLineData, TheShortFormReadsTextsOfEveryHabit)
{
    struct Row
    {
        QByteArray text;
        const char *options;
        const char *reason;
    };
    const Row rows[] = {
        {"Number;Northing\n1;12.5\n2A;0\n", "--delimiter ;", "a delimiter"},
        {"Number\tNorthing\n1\t12.5\n2A\t0\n", "--delimiter tab", "a tab, which is hard to type"},
        {"Number Northing\n1 12.5\n2A 0\n", "--delimiter whitespace", "blanks"},
        {"Number;Northing\n1;12.5\n2A;0\n", "--delimiter auto", "detected"},
        {"1,12.5\n2A,0\n", "--no-header --order PN", "an order"},
        {"1,x,12.5\n2A,x,0\n", "--no-header --columns Number,-,Northing", "names by position"},
        {"Pt,H\n1,12.5\n2A,0\n", "--columns Number=Pt,Northing=2", "columns of variables"},
        {"Pt,H\n1,12.5\n2A,0\n", "--columns Number=Pt --columns Northing=H", "one by one"},
        {"Number;Northing\n1;12,5\n2A;0\n", "--delimiter ; --decimal ,", "decimal commas"},
        {"Number;Northing\n1;0'012.5\n2A;0\n", "--delimiter ; --thousands '", "thousands"},
        {"Number,Northing\n1,12500\n2A,0\n", "--units length=mm", "a unit"},
        {"made\nNumber,Northing\n# x\n1,12.5\n\n2A,0\n", "--skip 1 --comment # --skip-blank-lines", "lines left out"},
        {wideText("Number,Northing\n1,12.5\n2A,0\n"), "--encoding utf-16", "two bytes a character"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("points.txt", row.text);
        const ProgramRun run = folder.run((QByteArray(shortForm) + "-d points.txt " + row.options).constData());
        EXPECT_EQ(run.out, tableText()) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.err, "") << row.reason;
    }
}

TEST(CommandLineData, TheShortFormReadsTextsOfEveryEncoding)
{
    struct Row
    {
        QByteArray number; ///< the bytes in the file
        const char *options;
        const char *expected; ///< what the report begins with; nothing for data that is refused
        const char *reason;
    };
    const Row rows[] = {
        {"\xC3\xA4", "", "\xC3\xA4    |", "UTF-8 without the option"},
        {"\xC3\xA4", "--encoding utf-8", "\xC3\xA4    |", "the same with it"},
        {"\xE4", "", "", "a byte that is no UTF-8"},
        {"\xE4", "--encoding latin-1", "\xC3\xA4    |", "a byte a character"},
        {"\xE4", "--encoding windows-1252", "\xC3\xA4    |", "the same in both"},
        {"\x80", "--encoding windows-1252", "\xE2\x82\xAC    |", "a euro, which Latin-1 does not have"},
        {"1", "--encoding utf-16", "", "no mark: another encoding"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("points.csv", "Number,Northing\n" + row.number + ",12.5\n");
        const ProgramRun run = folder.run((QByteArray(shortForm) + "-d points.csv " + row.options).constData());
        EXPECT_EQ(run.status, *row.expected != 0 ? 0 : 2) << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.out.startsWith(row.expected)) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out.isEmpty(), *row.expected == 0) << row.reason << "\n" << run.all().constData();
    }
}

TEST(CommandLineData, WhatIsWrongWithAnOptionNamesIt)
{
    struct Row
    {
        const char *options;
        int status;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"-d points.csv --delimiter ||", 2, "--delimiter ||: error: ", "two characters"},
        {"-d points.csv --order PNX", 2, "--order PNX: error: ", "no such letter"},
        {"-d points.csv --encoding ansi", 2, "--encoding ansi: error: one of utf-8", "no such encoding"},
        {"-d points.csv --units length=yard", 2, "--units length=yard: error: one of m, mm", "no such unit"},
        {"-d points.csv --units yard", 1, "--units \"yard\"", "no quantity"},
        {"-d points.csv --columns Number=1,Northing", 1, "--columns \"Northing\"", "names and numbers mixed"},
        {"-d points.csv --columns Nr=1", 2, "--columns Nr=1: error: ", "no such variable"},
        {"-d points.csv --columns Number=1,Northing=2,Number=2", 1, "--columns: \"Number\" was given twice",
         "a repeat"},
        {"-d points.csv --columns Number=1 --columns number=2", 1, "--columns: \"number\" was given twice", "the same"},
        {"-d points.csv --units length=m,length=ft", 1, "--units: \"length\" was given twice", "two units"},
        {"-d points.csv --skip=-1", 2, "--skip -1: error: ", "below 0"},
        {"--decimal ,", 1, "--data", "no data"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run((QByteArray(shortForm) + row.options).constData());
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.contains)) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.out, "") << row.reason;
    }
    const CommandLineFolder folder;
    EXPECT_EQ(folder.run("render job.json --delimiter ;").status, 1) << "a job says itself how its data is written";
}

TEST(CommandLineData, StandardInputIsDataOrAJob)
{
    const CommandLineFolder folder;
    const ProgramRun data = runWithInput(folder.path(), words((QByteArray(shortForm) + "-d -").constData()),
                                         "Number,Northing\n1,12.5\n2A,0\n");
    EXPECT_EQ(data.out, tableText()) << data.all().constData();
    const QByteArray job = folder.bytesOf("job.json");
    const ProgramRun made = runWithInput(folder.path(), words("render -"), job);
    EXPECT_EQ(made.out, jobText()) << made.all().constData();
    folder.put("input.json", QByteArray(job).replace("points.csv", "-"));
    const ProgramRun read = runWithInput(folder.path(), words("render input.json"), "Number,Northing\n1,12.5\n2A,0\n");
    EXPECT_EQ(read.out, jobText()) << read.all().constData();
    folder.put("objects.json", QByteArray(job).replace(R"("csv": "points.csv")", R"("json": "-")"));
    ASSERT_TRUE(folder.bytesOf("objects.json").contains(R"("json": "-")"));
    for (const char *objects : {R"([{"Number": 1, "Northing": 12.5}, {"Number": "2A", "Northing": 0}])",
                                "{\"Number\": 1, \"Northing\": 12.5}\n{\"Number\": \"2A\", \"Northing\": 0}\n"})
    {
        const ProgramRun listed = runWithInput(folder.path(), words("render objects.json"), objects);
        EXPECT_EQ(listed.out, jobText()) << objects << "\n" << listed.all().constData();
    }
    const ProgramRun noObject = runWithInput(folder.path(), words("render objects.json"), "[1]");
    EXPECT_EQ(noObject.status, 2) << noObject.all().constData();
    EXPECT_TRUE(noObject.err.contains(":1:2: error: ")) << noObject.all().constData();
    const ProgramRun both = runWithInput(folder.path(), words("render -"), QByteArray(job).replace("points.csv", "-"));
    EXPECT_EQ(both.status, 2) << both.all().constData();
    EXPECT_TRUE(both.err.startsWith("-:3:24: error: standard input is the job itself")) << both.err.constData();
    const ProgramRun list = runWithInput(folder.path(), words("render - --jobs -"), job);
    EXPECT_EQ(list.status, 1) << list.all().constData();
    const ProgramRun wrong = runWithInput(folder.path(), words("render -"), "{");
    EXPECT_EQ(wrong.status, 2);
    EXPECT_TRUE(wrong.err.startsWith("-:1:")) << wrong.err.constData();
    EXPECT_EQ(runWithInput(folder.path(), words("render - --update -o a.txt"), job).status, 0);
    EXPECT_EQ(runWithInput(folder.path(), words("render - --update -o a.txt"), QByteArray(job).replace("line", "lien"))
                  .status,
              2)
        << "nothing tells how old standard input is";
}

TEST(CommandLineData, NotesAreSaidAndWritten)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Nort\n1,12.5\n");
    const QByteArray column =
        "points.csv:1:8: note: the column \"Nort\" is not a variable of the dictionary \"Survey\": did "
        "you mean \"Northing\"?\n";
    const ProgramRun said = folder.run("render job.json -o a.txt --notes notes.json");
    EXPECT_EQ(said.status, 0) << said.all().constData();
    EXPECT_TRUE(said.err.endsWith("did you mean \"Nort\"?\n")) << said.err.constData();
    EXPECT_TRUE(said.err.contains(column)) << said.err.constData();
    EXPECT_EQ(said.err.count('\n'), 2) << said.err.constData();
    const QJsonArray notes = QJsonDocument::fromJson(folder.bytesOf("notes.json")).array();
    ASSERT_EQ(notes.size(), 2);
    EXPECT_EQ(notes[0].toObject()[QStringLiteral("kind")].toString(), QStringLiteral("unknown-column"));
    EXPECT_EQ(notes[1].toObject()[QStringLiteral("kind")].toString(), QStringLiteral("unfilled-field"));
    const ProgramRun named =
        folder.run("render -t t.xml -n CONTROL --table Points -d points.csv --columns Number,Nort");
    EXPECT_TRUE(named.err.startsWith("--columns Number,Nort: note: the column \"Nort\" is not a variable"))
        << named.err.constData();
    const QByteArray text = folder.bytesOf("a.txt");

    EXPECT_EQ(folder.run("render job.json -o a.txt --quiet").err, "") << "nothing but errors";

    for (const char *line : {"render job.json -o a.txt --strict --quiet --notes strict.json",
                             "render job.json -o a.txt --set strict=true"})
    {
        const ProgramRun strict = folder.run(line);
        EXPECT_EQ(strict.status, 2) << line << strict.all().constData();
        EXPECT_TRUE(strict.err.contains("points.csv:1:8: error: the column \"Nort\"")) << strict.err.constData();
        EXPECT_TRUE(strict.err.contains("error: no column fills the field \"Northing\"")) << strict.err.constData();
        EXPECT_EQ(strict.err.count('\n'), 2) << "each is said once\n" << strict.err.constData();
        EXPECT_EQ(folder.bytesOf("a.txt"), text) << "nothing is written";
    }
    EXPECT_EQ(folder.bytesOf("strict.json"), folder.bytesOf("notes.json"));
    // What is not a mistake does not end a strict job, and is not an error in it.
    folder.put("road.xml", R"(<?xml version="1.0"?>
<LandXML xmlns="http://www.landxml.org/schema/LandXML-1.2" version="1.2">
<Units><Metric linearUnit="meter" areaUnit="squareMeter" volumeUnit="cubicMeter" temperatureUnit="celsius" pressureUnit="HPA"/></Units>
<CgPoints><CgPoint name="1">1 2 3</CgPoint></CgPoints><Monuments><Monument name="a"/></Monuments></LandXML>)");
    folder.put("road-t.xml", controlTemplates().replace("Number", "Name"));
    folder.put("road.json", R"({"template": {"file": "road-t.xml", "name": "CONTROL"},
        "data": {"p": {"landxml": "road.xml", "list": "points"}}, "report": [{"table": "Points", "data": "p"}]})");
    const ProgramRun road = folder.run("render road.json --strict -o road.txt");
    EXPECT_EQ(road.status, 0) << road.all().constData();
    EXPECT_TRUE(road.err.contains("note: ")) << road.all().constData();
    EXPECT_FALSE(road.err.contains("error")) << road.all().constData();
    const ProgramRun toOutput = folder.run("render job.json --strict");
    EXPECT_EQ(toOutput.status, 2);
    EXPECT_EQ(toOutput.out, "") << "nothing of a strict job is printed";

    folder.put("points.csv", "Number,Northing\n1,12.5\n");
    folder.put("job.json",
               folder.bytesOf("job.json").replace("points.csv\"", "points.csv\", \"units\": {\"length\": \"m\"}"));
    EXPECT_EQ(folder.run("render job.json -o a.txt --strict --notes notes.json").status, 0);
    EXPECT_EQ(folder.bytesOf("notes.json").simplified(), "[ ]") << "a file without notes says that there are none";
}

TEST(CommandLineData, NotesTakeNoFileOfTheJob)
{
    struct Row
    {
        const char *line;
        int status;
        const char *contains;
    };
    constexpr Row rows[] = {
        {"render job.json -o a.txt --notes a.txt", 2, "already"},
        {"render job.json -o a.txt --notes points.csv", 2, "is data of the job"},
        {"render job.json -o a.txt --notes t.xml", 2, "is the template"},
        {"render job.json -o a.txt --notes job.json", 2, "is the job itself"},
        {"render job.json -o a.txt --notes -", 1, "--notes"},
        {"render job.json job.json -o {}.txt --notes n.json", 1, "{}"},
        {"render job.json -o a.txt --notes no/such/folder", 3, "could not be written"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << row.line << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.contains)) << row.line << run.all().constData();
    }
    const CommandLineFolder folder;
    EXPECT_EQ(folder.run("render job.json -o a.txt --notes {}-notes.json").status, 0);
    EXPECT_TRUE(folder.names().contains(QStringLiteral("job-notes.json")));
}

} // namespace
