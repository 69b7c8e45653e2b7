#include "FailingAllocation.h"
#include "JobRunnerFixture.h"

#include <new>
#include <optional>

namespace
{

/// Less than what the text needs for another block of characters, and more than anything else of such a job.
constexpr std::size_t ofTheText = 30'000;

/// Runs a job in which memory ends after the first step: there is then no room for more text.
class JobWithoutMemory
{
public:
    JobWithoutMemory() { folder_.put("t.xml", jobs::pointsTemplate()); }

    /// @param then  the step after the first
    /// @return whether it ended because memory ran out
    bool fails(const QByteArray &then)
    {
        const QByteArray full(31'900, 'x');
        folder_.put("job.json",
                    jobs::fixedFront +
                        jobs::templateJob(R"("site": {"values": {"Client": ")" + QByteArray(200, 'c') +
                                              R"("}}, "points": {"values": [{"Number": "1"}, {"Number": "2"},
                                              {"Number": "3"}, {"Number": "4"}, {"Number": "5"}, {"Number": "6"}]})",
                                          R"({"line": ")" + full + R"("}, )" + then + R"(, {"line": "never"})") +
                        "}");
        const auto source = kareport::JsonSource::read(folder_.path("job.json"));
        const auto read = kareport::readJob(std::get<kareport::JsonSource>(source));
        const auto &job = std::get<kareport::Job>(read);
        UReportDoc report(kareport::surroundingsOf(job));
        kareport::Progress progress(false);
        kareport::JobRunner runner(job, std::get<kareport::JsonSource>(source), progress);
        std::optional<FailingAllocation> failing;
        runner.stopWhen([&] {
            if (!failing && report.GetTextLength() >= full.size()) {
                failing.emplace(1, ofTheText, FailingAllocation::Extent::AllAfter);
            }
            return false;
        });
        bool isOutOfMemory = false;
        try {
            EXPECT_FALSE(runner.run(report));
        } catch (const std::bad_alloc &) {
            isOutOfMemory = true;
        }
        EXPECT_TRUE(failing && failing->hasFailed()) << then.constData();
        failing.reset();
        EXPECT_FALSE(report.CopyText().contains(QStringLiteral("never"))) << then.constData();
        return isOutOfMemory;
    }

private:
    FixedSurroundings surroundings_;
    JobFolder folder_;
};

TEST(JobAllocations, WhateverStepCannotBeWrittenEndsTheJob)
{
    struct Row
    {
        const char *step;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"block": "Site", "data": "site"})", "a block"},
        {R"({"table": "Points", "data": "points"})", "a table"},
        {R"({"table": "Sorted", "data": "points"})", "a sorted table"},
        {R"({"line": "no room for a line that is as long as this one: the block has a hundred characters left, or fewer, and no more"})",
         "a line"},
        {R"({"lineFeed": 71})", "blank lines"},
        {R"({"newPage": 71})", "a page's rest"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(JobWithoutMemory().fails(row.step)) << row.reason;
    }
}

} // namespace
