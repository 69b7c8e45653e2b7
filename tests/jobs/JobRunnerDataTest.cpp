#include "JobRunnerFixture.h"

namespace
{

using jobs::templateJob;
using jobs::TestJob;

TEST(JobRunnerData, ABlockTakesTheFirstRow)
{
    struct Row
    {
        const char *data;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("p": {"values": {"Number": "1", "Northing": 12.5}})", "one object"},
        {R"("p": {"values": [{"Number": "1", "Northing": 12.5}, {"Number": "2"}]})", "the first of a list"},
        {R"("p": {"values": [{"Number": "1", "Northing": 12.5}, 5]})", "what follows is not looked at"},
        {R"("p": {"csv": "points.csv"})", "the first row of a file"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.csv", "Number,Northing\n1,12.5\n2,13\n");
        job.run(templateJob(row.data, R"({"block": "Point", "data": "p"})"));
        EXPECT_EQ(job.text(), QStringLiteral("Pt|1\nNorth|12.500\n")) << row.reason;
    }
}

TEST(JobRunnerData, ABlockStillReadsTheWholeFile)
{
    TestJob job;
    job.folder.put("points.csv", "Number,Northing\n1,12.5\n2,x\n");
    job.run(templateJob(R"("p": {"csv": "points.csv"})", R"({"block": "Point", "data": "p"})"));
    ASSERT_TRUE(job.error) << "a file with a mistake is wrong, whichever of its rows is shown";
    EXPECT_EQ(job.error->place->line, 3);
}

TEST(JobRunnerData, AValueThatIsMissingLeavesItsLineOut)
{
    TestJob job;
    job.run(templateJob(R"("s": {"values": {"Client": "Harbour Board", "area": 1250.5, "Other": []}})",
                        R"({"block": "Site", "data": "s"})"));
    EXPECT_EQ(job.text(), QStringLiteral("Client|Harbour Board\nArea|1250.500\n"))
        << "names of variables match without regard to case, others are skipped";
}

TEST(JobRunnerData, ReadsCsvOfEveryForm)
{
    struct Row
    {
        QByteArray csv;
        const char *set;
        const char *reason;
    };
    const Row rows[] = {
        {"Number,Northing\n1,12.5\n2A,0\n", R"("csv": "points.csv")", "plain"},
        {"NUMBER,northing\r\n1,12.5\r\n2A,0", R"("csv": "points.csv")", "names without regard to case"},
        {"\xEF\xBB\xBF\"Number\",\"Northing\"\n\"1\",\"12.5\"\n\"2A\",\"0\"\n", R"("csv": "points.csv")",
         "a byte-order mark and quotes"},
        {"Code,Northing,Number\nx,12.5,1\n\"a,\n\"\"b\",0,2A\n\n\n", R"("csv": "points.csv")",
         "other order, and a column that the dictionary does not know"},
        {"Number;Northing\n1;12.5\n2A;0\n", R"("csv": "points.csv", "delimiter": ";")", "semicolons"},
        {"Number\tNorthing\n1\t12.5\n2A\t0\n", R"("csv": "points.csv", "delimiter": "\t")", "tabs"},
        {"Number,Northing\n1,12500\n2A,-0\n", R"("csv": "points.csv", "units": {"length": "mm"})", "millimetres"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.csv", row.csv);
        job.run(
            templateJob(QByteArray(R"("p": {)") + row.set + "}", R"({"line": "x"}, {"table": "Points", "data": "p"})"));
        EXPECT_EQ(job.text(), QStringLiteral("x\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n")) << row.reason;
    }
}

TEST(JobRunnerData, ValuesAreShownInTheSettingsUnits)
{
    TestJob job;
    job.run(templateJob(
        R"("p": {"values": {"Number": "1", "Northing": 10}, "units": {"length": "ft"}},
           "s": {"values": {"Area": 2, "Bearing": "45-30-15"}, "units": {"area": "ha", "angle": "dms"}})",
        R"({"block": "Point", "data": "p"}, {"block": "Site", "data": "s"})"));
    EXPECT_EQ(job.text(), QString::fromUtf8("Pt|1\nNorth|3.048\nArea|20000.000\nBearing|N 45\xC2\xB0"
                                            "30'15\" E\n"));
    job.run(templateJob(
        R"("p": {"values": {"Number": "1", "Northing": 3.048}},
           "s": {"values": {"Area": 20000, "Bearing": -100}, "units": {"angle": "gon"}})",
        R"({"block": "Point", "data": "p"}, {"block": "Site", "data": "s"})",
        R"("settings": {"lengthUnit": "ft", "areaUnit": "ha", "bearingUnit": "gon", "bearingStyle": "circle"}, )"));
    EXPECT_EQ(job.text(), QStringLiteral("Pt|1\nNorth|10.000\nArea|2.000\nBearing|300g\n"));
}

TEST(JobRunnerData, ASortedTableIsTheSameFromFileAndValues)
{
    const char *const csv = R"("p": {"csv": "points.csv"})";
    const char *const values = R"("p": {"values": [{"Number": "10", "Northing": 2}, {"Number": "9", "Northing": 2},
        {"Number": "1"}, {"Number": "2", "Northing": -1}, {"Number": "3", "Northing": 2}]})";
    for (const char *data : {csv, values}) {
        TestJob job;
        job.folder.put("points.csv", "Number,Northing\n10,2\n9,2\n1,\n2,-1\n3,2\n");
        job.run(templateJob(data, R"({"line": "x"}, {"table": "Sorted", "data": "p"})"));
        EXPECT_EQ(job.text(), QStringLiteral("x\nPt   |    North\n\n1    |    0.000\n2    |   -1.000\n"
                                             "3    |    2.000\n9    |    2.000\n10   |    2.000\n"))
            << data;
    }
}

TEST(JobRunnerData, ADataSetMayBeUsedTwice)
{
    TestJob job;
    job.folder.put("points.csv", "Number,Northing\n2,1\n1,2\n");
    job.run(templateJob(R"("p": {"csv": "points.csv"})",
                        R"({"block": "Point", "data": "p"}, {"table": "Points", "data": "p", "headingAfter": 1},
                           {"block": "Point", "data": "p"})"));
    EXPECT_EQ(job.text(), QStringLiteral("Pt|2\nNorth|1.000\nPt   |    North\n2    |    1.000\n1    |    2.000\n"
                                         "Pt|2\nNorth|1.000\n"));
}

} // namespace
