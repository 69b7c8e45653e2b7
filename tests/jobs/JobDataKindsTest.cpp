#include "DataKinds.h"

#include "GeoPackageFile.h"
#include "JobRunnerFixture.h"

#include <gtest/gtest.h>

namespace
{

using jobs::templateJob;
using jobs::TestJob;

/// The table "Points" with its rows.
QString pointsReport()
{
    return QStringLiteral("x\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n");
}

const char *const pointsStep = R"({"line": "x"}, {"table": "Points", "data": "p"})";

TEST(JobDataKinds, AreListedOnce)
{
    QStringList keys;
    for (const kareport::DataKind &kind : kareport::dataKinds()) {
        EXPECT_FALSE(keys.contains(kind.key)) << kind.key.toStdString();
        EXPECT_FALSE(kind.options.contains(kind.key)) << kind.key.toStdString();
        EXPECT_FALSE(kind.options.contains(QStringLiteral("units"))) << kind.key.toStdString() << ": all have units";
        EXPECT_TRUE(kind.read) << kind.key.toStdString();
        keys.append(kind.key);
    }
    for (const char *key : {"csv", "values", "sqlite", "postgresql", "json", "landxml"}) {
        EXPECT_TRUE(keys.contains(QLatin1StringView(key))) << key;
    }
}

TEST(JobDataKinds, OneReportComesOfTextsOfEveryHabit)
{
    struct Row
    {
        QByteArray text;
        const char *set;
        const char *reason;
    };
    const Row rows[] = {
        {"Number Northing\n1   12.5\n  2A\t0\n", R"("delimiter": "whitespace")", "blanks and tabs"},
        {"Number;Northing\n1;12.5\n2A;0\n", R"("delimiter": "auto")", "a semicolon that is detected"},
        {"1,12.5\n2A,0\n", R"("header": false, "columns": ["Number", "Northing"])", "columns by their positions"},
        {"a,b,c\n1,?,12.5\n2A,?,0\n", R"("columns": ["Number", "-", "Northing"])", "instead of a header row's names"},
        {"1,?,12.5\n2A,?,0\n", R"("header": false, "columns": ["Number", null, "Northing"])", "one skipped"},
        {"1,?,12.5\n2A,?,0\n", R"("header": false, "columns": {"Northing": 3, "Number": 1})", "by their numbers"},
        {"Pt,Hoch\n1,12.5\n2A,0\n", R"("columns": {"Number": "PT", "Northing": "Hoch"})", "by names of the header row"},
        {"1,12.5,9\n2A,0,9\n", R"("header": false, "order": "PN-")", "an order"},
        {"1;1,25e1\n2A;0,0\n", R"("header": false, "order": "PN", "delimiter": ";", "decimal": ",")", "decimal commas"},
        {"Number;Northing\n1;0.012,5\n2A;0\n", R"("delimiter": ";", "decimal": ",", "thousands": ".")", "thousands"},
        {"Number,Northing\n1,\"12,5\"\n2A,\"0,0\"\n", R"("delimiter": ",", "decimal": ",")",
         "decimal commas in quotes, with commas between the cells"},
        {"Number,Northing\n1,\"0,012.5\"\n2A,0\n", R"("delimiter": ",", "thousands": ",")", "thousands in quotes"},
        {"made by\nsomebody\nNumber,Northing\n1,12.5\n2A,0\n", R"("skip": 2)", "lines before the header row"},
        {"# made\nNumber,Northing\n#1,99\n1,12.5\n2A,0\n", R"("comment": "#")", "comments"},
        {"Number,Northing\n\n1,12.5\n  \n2A,0\n", R"("skipBlankLines": true)", "blank lines"},
        {QByteArray("\xFF\xFEN\0u\0m\0b\0e\0r\0,\0N\0o\0r\0t\0h\0i\0n\0g\0\n\0"
                    "1\0,\0"
                    "1\0"
                    "2\0.\0"
                    "5\0\n\0"
                    "2\0A\0,\0"
                    "0\0",
                    56),
         R"("encoding": "utf-16")", "two bytes a character"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.txt", row.text);
        job.run(templateJob(QByteArray(R"("p": {"csv": "points.txt", )") + row.set + "}", pointsStep));
        EXPECT_EQ(job.text(), pointsReport()) << row.reason;
    }
}

TEST(JobDataKinds, OneReportComesOfEverySource)
{
    struct Row
    {
        const char *set;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("values": [{"Number": "1", "Northing": 12.5}, {"Number": "2A", "Northing": 0}])", "values"},
        {R"("csv": "points.csv")", "a text"},
        {R"("sqlite": "points.gpkg", "table": "points")", "a table"},
        {R"("sqlite": "points.gpkg", "query": "SELECT Number, Northing AS N FROM points", "columns": {"Northing": "n"})",
         "a query"},
        {R"("sqlite": "points.gpkg", "table": "points", "columns": {"Northing": "@y"})", "points of a GeoPackage"},
        {R"("json": "points.json")", "a list of objects"},
        {R"("json": "lines.json", "columns": {"Northing": "N"})", "an object a line"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.csv", "Number,Northing\n1,12.5\n2A,0\n");
        job.folder.put("points.json", R"([{"Number": "1", "Northing": 12.5}, {"Number": "2A", "Northing": 0}])");
        job.folder.put("lines.json", "{\"Number\": 1, \"N\": \"12.5\"}\n{\"Number\": \"2A\", \"N\": 0}\n");
        geo::runSql(job.folder.path("points.gpkg"),
                    geo::packageSql() +
                        "CREATE TABLE points (fid INTEGER PRIMARY KEY, geom POINT, Number TEXT, Northing REAL);"
                        "INSERT INTO points VALUES (1, " +
                        geo::pointLiteral(1, 12.5, 3, 4, 25832) + ", '1', 12.5), (2, " +
                        geo::pointLiteral(2, 0, 3, 4, 25832) +
                        ", '2A', 0);"
                        "INSERT INTO gpkg_geometry_columns VALUES ('points', 'geom', 'POINT', 25832, 1, 1);");
        job.run(templateJob(QByteArray(R"("p": {)") + row.set + "}", pointsStep));
        EXPECT_EQ(job.text(), pointsReport()) << row.reason;
    }
}

TEST(JobDataKinds, WhatIsWrongWithASourceHasItsPlace)
{
    struct Row
    {
        const char *set; ///< "@" is before what is meant, when that is in the job
        const char *file;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("csv": "points.csv", "columns": {"Northing": @"Nord"})", "job.json", "there is no column \"Nord\"",
         "a column that is not there"},
        {R"("csv": "points.csv", "columns": {"Nothing": @"Northing"})", "job.json", "did you mean \"Northing\"?",
         "a variable that is not there"},
        {R"("sqlite": @"no.db", "table": "points")", "job.json", "there is no database", "no file"},
        {R"("sqlite": "points.csv", "table": "points")", "points.csv", "not a SQLite database", "a text"},
        {R"("sqlite": "points.db", "table": "point")", "points.db", "did you mean \"points\"?", "no such table"},
        {R"("sqlite": "points.db", "query": "DELETE FROM points")", "points.db", "single SELECT", "no query"},
        {R"("sqlite": "points.db", "table": "points", "columns": {"Number": @"@x"})", "job.json",
         "there is no column \"@x\"", "no geometry"},
        {R"("json": @"no.json")", "job.json", "cannot be read", "no file"},
        {R"("json": "points.csv")", "points.csv", "a list of objects", "a text"},
        {R"("postgresql": "host=/nowhere", "query": "SELECT 1")", "host=/nowhere", "cannot be connected to",
         "no server"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.csv", "Number,Northing\n1,12.5\n");
        geo::runSql(job.folder.path("points.db"), "CREATE TABLE points (Number TEXT, Northing REAL)");
        const QByteArray set = row.set;
        const qsizetype mark = set.indexOf("@\"") >= 0 ? set.indexOf("@\"") : set.size();
        const QByteArray text = set.first(mark) + set.mid(mark + 1);
        const QByteArray front = QByteArray(R"("p": {)");
        job.run(templateJob(front + text + "}", pointsStep));
        ASSERT_TRUE(job.error) << row.reason;
        const QString message = job.error->message();
        EXPECT_TRUE(job.error->file.endsWith(QLatin1StringView(row.file)))
            << row.reason << ": " << message.toStdString();
        EXPECT_TRUE(message.contains(QLatin1StringView(row.contains))) << row.reason << ": " << message.toStdString();
        if (mark < set.size()) {
            const QByteArray before = jobs::fixedFront + templateJob(front, {}); // all of it is in one line
            const qsizetype column = before.indexOf(front) + front.size() + mark + 1;
            ASSERT_TRUE(job.error->place) << row.reason;
            EXPECT_EQ(job.error->place->column, column) << row.reason << ": " << message.toStdString();
        }
    }
}

TEST(JobDataKinds, ABlockNeedsARow)
{
    struct Row
    {
        const char *set;
        const char *contains;
    };
    constexpr Row rows[] = {
        {R"("csv": "empty.csv")", "empty.csv:1:1: error: a row was expected after the header row"},
        {R"("csv": "nothing.csv", "header": false, "order": "PN")",
         "nothing.csv:1:1: error: a row was expected: a block"},
        {R"("json": "empty.json")", "the data \"p\" has no row"},
        {R"("sqlite": "points.db", "table": "points")", "the data \"p\" has no row"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("empty.csv", "Number,Northing\n");
        job.folder.put("nothing.csv", "");
        job.folder.put("empty.json", "[]");
        geo::runSql(job.folder.path("points.db"), "CREATE TABLE points (Number TEXT, Northing REAL)");
        job.run(templateJob(QByteArray(R"("p": {)") + row.set + "}", R"({"block": "Point", "data": "p"})"));
        ASSERT_TRUE(job.error) << row.set;
        EXPECT_TRUE(job.error->message().contains(QLatin1StringView(row.contains)))
            << row.set << ": " << job.error->message().toStdString();
    }
}

} // namespace
