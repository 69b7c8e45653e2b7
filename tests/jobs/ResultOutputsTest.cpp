#include "ResultJob.h"

#include <gmock/gmock.h>

namespace
{

using jobs::ResultJob;
using jobs::templateJob;
using testing::HasSubstr;

const char *const twoPoints =
    R"("p": {"values": [{"Number": "1, \"a\"", "Northing": 12.5}, {"Number": "2A"}], "units": {"length": "ft"}})";
const char *const oneTable = R"({"line": "x"}, {"table": "Points", "data": "p"})";

QByteArray withOutputs(const QByteArray &job, const QByteArray &outputs)
{
    return job + R"(, "output": [)" + outputs + "]";
}

TEST(ResultOutputs, RowsAreWrittenInTheUnitsOfTheData)
{
    ResultJob job;
    job.run(withOutputs(templateJob(twoPoints, oneTable), R"("p.csv", "p.jsonl")"));
    EXPECT_EQ(job.bytes("p.csv"), "Number,Northing\n\"1, \"\"a\"\"\",12.5\n2A,\n")
        << "feet as in the data; a missing value is nothing";
    EXPECT_EQ(job.bytes("p.jsonl"), "{\"Number\":\"1, \\\"a\\\"\",\"Northing\":12.5}\n"
                                    "{\"Number\":\"2A\",\"Northing\":null}\n");
}

TEST(ResultOutputs, TheTextIsKeptWhereAnOutputHasIt)
{
    struct Row
    {
        const char *outputs;
        bool hasText;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("p.csv", "p.jsonl")", false, "values alone"},
        {R"("p.csv", "p.txt")", true, "a text as well"},
    };
    constexpr int count = 100'000;
    constexpr qsizetype widthOfRow = 10; // at least
    QByteArray points = "Number,Northing\n";
    for (int i = 0; i < count; ++i) {
        points += QByteArray::number(i) + ",1.5\n";
    }
    for (const Row &row : rows) {
        ResultJob job;
        job.discardsText = true;
        job.folder.put("points.csv", points);
        job.run(withOutputs(templateJob(R"("p": {"csv": "points.csv"})", R"({"table": "Points", "data": "p"})"),
                            row.outputs));
        EXPECT_EQ(job.bytes("p.csv"), points.toStdString()) << row.reason;
        EXPECT_EQ(job.text.size() > widthOfRow * count, row.hasText) << row.reason << ": the last piece may be there";
    }
}

TEST(ResultOutputs, RowsAreWrittenAsPrinted)
{
    ResultJob job;
    job.run(withOutputs(templateJob(twoPoints, oneTable), R"({"file": "p.csv", "values": "printed", "delimiter": ";"},
        {"file": "p.dat", "as": "jsonl", "values": "printed"})"));
    EXPECT_EQ(job.bytes("p.csv"), "Number;Northing\n\"1, \"\"a\"\"\";3.810\n2A;0.000\n") << "in metres, of 3 decimals";
    EXPECT_EQ(job.bytes("p.dat"), "{\"Number\":\"1, \\\"a\\\"\",\"Northing\":\"3.810\"}\n"
                                  "{\"Number\":\"2A\",\"Northing\":\"0.000\"}\n");
}

TEST(ResultOutputs, WhatIsPrintedAsHashesIsWhole)
{
    ResultJob job;
    job.run(withOutputs(templateJob(R"("p": {"values": [{"Number": "123456", "Northing": 12345678}]})", oneTable,
                                    R"("options": {"printHash": true}, )"),
                        R"({"file": "p.csv", "values": "printed"})"));
    EXPECT_THAT(job.text.toStdString(), HasSubstr("#####|#########"));
    EXPECT_EQ(job.bytes("p.csv"), "Number,Northing\n123456,12345678.000\n");
}

TEST(ResultOutputs, RowsAreInTheOrderOfTheReport)
{
    ResultJob job;
    job.run(
        withOutputs(templateJob(R"("p": {"values": [{"Number": "1", "Northing": 2}, {"Number": "2", "Northing": 1}]})",
                                R"({"table": "Sorted", "data": "p"})"),
                    R"("p.csv")"));
    EXPECT_EQ(job.bytes("p.csv"), "Number,Northing\n2,1\n1,2\n");
}

TEST(ResultOutputs, ABlockIsOneRow)
{
    ResultJob job;
    const QByteArray data = R"("s": {"values": {"Client": "Harbour Board", "Bearing": 90}}, )";
    job.run(withOutputs(templateJob(data + twoPoints, R"({"block": "Site", "data": "s"})"), R"("s.csv")"));
    EXPECT_EQ(job.bytes("s.csv"), "Client,Area,Bearing\nHarbour Board,,90\n") << "the only step with data";
    job.run(withOutputs(
        templateJob(data + twoPoints, R"({"block": "Site", "data": "s"}, {"table": "Points", "data": "p"})"),
        R"({"file": "s.jsonl", "block": "site", "values": "printed"}, "p.csv")"));
    EXPECT_EQ(job.bytes("s.jsonl"), "{\"Client\":\"Harbour Board\",\"Area\":\"\",\"Bearing\":\"N 90\xC2\xB0"
                                    "00'00\\\" E\"}\n")
        << "a line that is left out has no text";
    EXPECT_THAT(job.bytes("p.csv"), HasSubstr("Number,Northing\n")) << "a table comes before a block";
}

TEST(ResultOutputs, AnOutputHasTheRowsOfOneStep)
{
    const QByteArray data = QByteArray(twoPoints) + R"(, "q": {"values": [{"Number": "7", "Northing": 1}]})";
    const QByteArray steps = R"({"table": "Points", "data": "p"}, {"table": "Sorted", "data": "p"},
        {"table": "Points", "data": "q"}, {"block": "Point", "data": "q"})";
    struct Row
    {
        const char *output;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {R"({"file": "r.csv", "table": "Sorted"})", "2A,", "a table of one step"},
        {R"({"file": "r.csv", "data": "q"})", "7,1", "data of one step of a table"},
        {R"({"file": "r.csv", "table": "POINTS", "data": "q"})", "7,1", "both; names in any case"},
        {R"({"file": "r.csv", "block": "Point"})", "7,1", "a block"},
        {R"("r.csv")", "r.csv\" has the rows of one step, and 3 steps may be meant", "three tables"},
        {R"({"file": "r.csv", "table": "Points"})", "and 2 steps may be meant", "two steps of the table"},
        {R"({"file": "r.csv", "data": "p"})", "and 2 steps may be meant", "two steps of the data"},
        {R"({"file": "r.csv", "table": "Stations"})", "no such step of the job writes one", "no step of the table"},
        {R"({"file": "r.csv", "table": "Point"})", "no such step of the job writes one", "it is a block"},
        {R"({"file": "r.csv", "data": "r"})", "no such step of the job writes one", "no step of the data"},
    };
    for (const Row &row : rows) {
        ResultJob job;
        job.run(withOutputs(templateJob(data, steps), row.output));
        EXPECT_THAT(job.bytes("r.csv"), HasSubstr(row.expected)) << row.reason;
    }
}

TEST(ResultOutputs, WhatIsDiscardedIsNotMeant)
{
    ResultJob job;
    job.run(withOutputs(templateJob(twoPoints, R"({"table": "Points", "data": "p"}, {"clear": true},
        {"table": "Sorted", "data": "p"})"),
                        R"("p.csv")"));
    EXPECT_EQ(job.bytes("p.csv"), "Number,Northing\n2A,\n\"1, \"\"a\"\"\",12.5\n");
}

TEST(ResultOutputs, WhatTheStepNamesIsAmongTheColumnsOfTheData)
{
    const QByteArray step = R"({"table": "Points", "data": "p", "sort": "Count",
        "compute": [{"variable": "Northing", "sum": ["Easting", "Easting"]}], "where": [{"of": "Note", "isNot": "x"}]})";
    const QByteArray outputs =
        R"("p.csv", "p.jsonl", {"file": "s.csv", "schema": "s.json"}, {"file": "q.csv", "values": "printed"})";
    ResultJob job;
    job.run(withOutputs(templateJob(R"("p": {"values": [{"Number": "2", "Easting": 2, "Count": 5},
        {"Number": "3", "Easting": 1, "Count": 1, "Note": "X"}, {"Number": "1", "Easting": 4, "Count": 3, "Note": "y"}]})",
                                    step),
                        outputs));
    EXPECT_EQ(job.bytes("p.csv"), "Number,Northing,Easting,Note,Count\n1,8,4,y,3\n2,4,2,,5\n");
    EXPECT_THAT(job.bytes("p.jsonl"), HasSubstr(R"({"Number":"1","Northing":8,"Easting":4,"Note":"y","Count":3})"));
    EXPECT_THAT(job.bytes("s.json"), HasSubstr(R"({"name": "Note", "label": "Note", "type": "TEXT", "shown": false})"));
    EXPECT_EQ(job.bytes("q.csv"), "Number,Northing\n1,8.000\n2,4.000\n") << "what is printed is what is shown";
    const QString text = job.text;
    const std::string rows = job.bytes("p.csv");
    job.folder.put("in.csv", QByteArray::fromStdString(rows));
    job.run(withOutputs(templateJob(R"("p": {"csv": "in.csv"})", step), R"("p.csv")"));
    EXPECT_EQ(job.text.toStdString(), text.toStdString()) << "read again, it is the same report";
    EXPECT_EQ(job.bytes("p.csv"), rows);
}

TEST(ResultOutputs, ATextThatIsAFormulaElsewhereIsSaid)
{
    ResultJob job;
    job.run(withOutputs(
        templateJob(R"("p": {"values": [{"Number": "=1+1"}, {"Number": "@x"}, {"Number": "1=1"}]})", oneTable),
        R"("p.csv", "p.jsonl")"));
    EXPECT_THAT(job.bytes("p.csv"), HasSubstr("=1+1,")) << "it is written as it is";
    EXPECT_EQ(
        job.warnings.at("p.csv").join(u'|'),
        QStringLiteral("2 texts begin with = or @: a spreadsheet program that opens the file takes them for formulas"));
    EXPECT_TRUE(job.warnings.at("p.jsonl").isEmpty());
}

TEST(ResultOutputs, ASchemaSaysWhatTheColumnsAre)
{
    ResultJob job;
    job.run(withOutputs(templateJob(twoPoints, oneTable), R"({"file": "p.csv", "schema": "p.schema.json"})"));
    EXPECT_EQ(job.bytes("p.schema.json"), R"({
  "table": "Points",
  "data": "p",
  "values": "data",
  "rows": 2,
  "columns": [
    {"name": "Number", "label": "Pt", "type": "NUMBER"},
    {"name": "Northing", "label": "North", "type": "COORDINATE", "unit": "ft"}
  ]
}
)");
    job.run(withOutputs(templateJob(twoPoints, oneTable, R"("settings": {"lengthUnit": "usft"}, )"),
                        R"({"file": "p.csv", "schema": "s", "values": "printed"})"));
    EXPECT_THAT(job.bytes("s"), HasSubstr(R"("unit": "usft")")) << "the unit of what is printed";
}

TEST(ResultOutputs, KeysAreThoseOfTheKind)
{
    struct Row
    {
        const char *output;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {R"({"file": "p.rep", "values": "printed"})", "unknown key \"values\": file, as expected", "a report has none"},
        {R"({"file": "p.jsonl", "delimiter": ";"})", "unknown key \"delimiter\"", "of CSV alone"},
        {R"({"file": "p.csv", "delimitr": ";"})", "did you mean \"delimiter\"?", "the nearest key"},
        {R"({"file": "p.csv", "delimiter": "ab"})", "one ASCII character", "two characters"},
        {R"({"file": "p.csv", "delimiter": "."})", "one ASCII character", "of numbers"},
        {R"({"file": "p.csv", "values": "print"})", "did you mean \"printed\"?", "no such values"},
        {R"({"file": "p.csv", "table": ""})", "a text that is not empty", "an empty name"},
        {R"({"file": "p.csv", "table": "Points", "block": "Site"})", "not both", "a table and a block"},
        {R"({"file": "p.csv", "schema": "-"})", "the name of a file", "no standard output"},
        {R"({"file": "p.csv", "schema": 5})", "a text was expected", "no text"},
    };
    for (const Row &row : rows) {
        ResultJob job;
        job.run(withOutputs(templateJob(twoPoints, oneTable), row.output));
        EXPECT_THAT(job.error.toStdString(), HasSubstr(row.expected)) << row.reason;
    }
}

TEST(ResultOutputs, ReportsAreTheSameWithAndWithoutThem)
{
    ResultJob with;
    with.run(withOutputs(templateJob(twoPoints, oneTable), R"("p.csv", "p.jsonl")"));
    jobs::TestJob without;
    without.run(templateJob(twoPoints, oneTable));
    EXPECT_EQ(with.text.remove(u'\r'), without.text());
}

} // namespace
