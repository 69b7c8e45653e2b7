#include "JobRunnerFixture.h"
#include "ReportTextWriter.h"

#include <QBuffer>

#include <gtest/gtest.h>

// A job whose text goes into a device while it is made.

namespace
{

TEST(JobStream, EndsWithTheJobWhetherItSucceedsOrNot)
{
    struct Row
    {
        const char *steps;
        bool isMade;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"line": "a"})", true, "a report that is made"},
        {R"({"line": "a"}, {"table": "Points", "data": "none"})", false, "a report that is not finished"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const JobFolder folder;
        folder.put("t.xml", jobs::pointsTemplate());
        folder.put("job.json", jobs::fixedFront + jobs::templateJob(R"("none": {"csv": "none.csv"})", row.steps) + '}');
        const auto read = kareport::JsonSource::read(folder.path("job.json"));
        const auto &source = std::get<kareport::JsonSource>(read);
        const auto job = kareport::readJob(source);
        UReportDoc report(kareport::surroundingsOf(std::get<kareport::Job>(job)));
        kareport::Progress progress(false);
        QBuffer device;
        device.open(QIODevice::WriteOnly);
        {
            kareport::ReportTextWriter writer(device, kareport::LineEnds::PlainText);
            kareport::JobRunner runner(std::get<kareport::Job>(job), source, progress);
            EXPECT_EQ(runner.run(report, &writer).has_value(), !row.isMade) << row.reason;
        }
        // More than a report holds back of a text that it hands on.
        const QString line(100'000, u'x');
        for (int i = 0; i < 50; ++i) {
            EXPECT_TRUE(report.Write(line, 0)) << row.reason;
        }
        EXPECT_GE(report.GetTextLength(), 50 * line.size()) << row.reason << ": it is kept, as there is no writer";
        EXPECT_FALSE(device.data().contains("xx")) << row.reason;
    }
}

} // namespace
