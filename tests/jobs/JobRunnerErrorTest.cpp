#include "InputErrorText.h"
#include "JobRunnerFixture.h"

namespace
{

using jobs::templateJob;
using jobs::TestJob;

TEST(JobRunnerError, OfAStepHasItsPlaceInTheJob)
{
    struct Row
    {
        const char *data;
        const char *steps; ///< "@" marks the mistake, here or in the data
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("p": {"values": []})", R"({"line": "x"}, {"table": @"Nope", "data": "p"})", "Points, Sorted, Stations",
         "no such table: the others are named"},
        {R"("p": {"values": {}})", R"({"block": @"Points", "data": "p"})", "Site, Point", "a table is not a block"},
        {R"("p": {"values": []})", R"({"table": @"Lost", "data": "p"})", "\"Nowhere\"", "its dictionary is missing"},
        {R"("p": {"values": []})", R"({"block": @"Point", "data": "p"})", "no row", "a block of no rows"},
        {R"("p": {"values": [{"Number": "1"}, @5]})", R"({"table": "Points", "data": "p"})", "an object was expected",
         "a row that is not an object"},
        {R"("p": {"values": [{}, {"Northing": @"x"}]})", R"({"table": "Points", "data": "p"})", "a number was expected",
         "a value that does not fit"},
        {R"("p": {"values": {"Northing": @true}})", R"({"block": "Point", "data": "p"})", "\"Northing\"",
         "a value that does not fit, in a block"},
        {R"("p": {"csv": @"missing.csv"})", R"({"line": "x"}, {"table": "Points", "data": "p"})", "missing.csv",
         "a file that is missing: the job says where it was looked for"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("empty.csv", "Number,Northing\n");
        const MarkedText marked(jobs::fixedFront + templateJob(row.data, row.steps) + '}');
        job.runWhole(marked.text);
        ASSERT_TRUE(job.error) << row.reason;
        EXPECT_EQ(job.error->file, job.folder.path("job.json")) << row.reason;
        EXPECT_EQ(placeText(job.error), marked.place) << row.reason << ": " << job.text().toStdString();
        EXPECT_TRUE(job.text().contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << job.text().toStdString();
    }
}

TEST(JobRunnerError, OfACsvHasItsPlaceInTheFile)
{
    struct Row
    {
        QByteArray csv;
        const char *step;
        const char *place;
        const char *reason;
    };
    const QByteArray rows1000 = QByteArray("1,2\n").repeated(1000);
    const Row rows[] = {
        {"", R"({"table": "Points", "data": "p"})", "1:1", "an empty file"},
        {"Number,Northing\n1,x\n", R"({"table": "Points", "data": "p"})", "2:3", "a cell that does not fit"},
        {"Number,Northing\n1,x\n", R"({"block": "Point", "data": "p"})", "2:3", "the same in a block"},
        {"Number,Northing\n1,x\n", R"({"table": "Sorted", "data": "p"})", "2:3", "the same in a sorted table"},
        {"Number,Northing\n" + rows1000 + "1,2,3\n", R"({"table": "Points", "data": "p"})", "1002:5",
         "a cell too many"},
        {"Number,Northing\n" + rows1000 + "1,\"2\n", R"({"table": "Points", "data": "p"})", "1002:3", "an open quote"},
        {"Number,Northing\n1,\xFF\n", R"({"table": "Points", "data": "p"})", "2:3", "not UTF-8"},
        {"Number,number\n1,2\n", R"({"table": "Points", "data": "p"})", "1:8", "a column twice"},
        {QByteArray(2 << 20, 'x'), R"({"table": "Points", "data": "p"})", "1:1", "an endless line"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("points.csv", row.csv);
        job.run(templateJob(R"("p": {"csv": "points.csv"})", row.step));
        ASSERT_TRUE(job.error) << row.reason;
        EXPECT_EQ(job.error->file, job.folder.path("points.csv")) << row.reason;
        EXPECT_EQ(placeText(job.error), QString::fromUtf8(row.place)) << row.reason << ": " << job.text().toStdString();
    }
}

TEST(JobRunnerError, OfATemplateFile)
{
    const QByteArray whole = "<!-- survey -->\n" + jobs::pointsTemplate();
    struct Row
    {
        QByteArray content;
        const char *place;
        const char *contains;
        const char *reason;
    };
    const Row rows[] = {
        {"", "1:1", "empty", "an empty file"},
        {QByteArray(5000, '\0'), "1:1", "ReportTemplate", "zero bytes"},
        {QByteArray("\x89PNG\r\n\x1A\n\0\0\0\rIHDR", 16), "1:1", "ReportTemplate", "a picture"},
        {"no markup", "1:1", "ReportTemplate", "a plain text"},
        {whole.first(whole.size() / 2), "2:1", "closing tag", "cut off in the middle"},
        {"\n" + QByteArray(whole).replace("<Name>T</Name>", "<Name>U</Name>"), "1:1", "one of U", "another name"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("t.xml", row.content);
        job.run(templateJob("", R"({"line": "x"})"));
        ASSERT_TRUE(job.error) << row.reason;
        EXPECT_EQ(job.error->file, job.folder.path("t.xml")) << row.reason;
        EXPECT_EQ(placeText(job.error), QString::fromUtf8(row.place)) << row.reason << ": " << job.text().toStdString();
        EXPECT_TRUE(job.text().contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << job.text().toStdString();
        EXPECT_FALSE(job.text().contains(u'\n')) << row.reason;
    }
}

TEST(JobRunnerError, AMissingTemplateFileIsNamedWhereTheJobAsksForIt)
{
    TestJob job;
    const MarkedText marked(R"({"report": [],
        "template": {"name": "T", "file": @"none.xml"}})");
    job.runWhole(marked.text);
    ASSERT_TRUE(job.error);
    EXPECT_EQ(job.error->file, job.folder.path("job.json"));
    EXPECT_EQ(placeText(job.error), marked.place);
    EXPECT_TRUE(job.error->text.contains(u"none.xml"));
}

TEST(JobRunnerError, MarginsThatLeaveNoRoomAreRefused)
{
    TestJob job;
    const MarkedText marked(R"({"report": [], "page": @{"margins": [10000, 0, 12000, 0]}})");
    job.runWhole(marked.text);
    ASSERT_TRUE(job.error);
    EXPECT_EQ(placeText(job.error), marked.place);
    EXPECT_TRUE(job.error->text.contains(u"smaller margins"));
}

} // namespace
