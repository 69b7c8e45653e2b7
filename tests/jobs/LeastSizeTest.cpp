#include "LeastSize.h"

#include "ReportFixture.h"

#include <gtest/gtest.h>

namespace
{

using kareport::Job;
using kareport::Output;
using kareport::OutputKind;

Output withLimit(std::optional<qint64> mostBytes)
{
    return {QStringLiteral("a"), OutputKind::Text, mostBytes};
}

TEST(LeastSize, TheSmallestLimitOfAnOutputIsTheReports)
{
    Job job;
    EXPECT_FALSE(kareport::sizeLimit(job));
    job.outputs.push_back(withLimit(std::nullopt));
    EXPECT_FALSE(kareport::isTooLarge(job, qint64(1) << 60)) << "any size";
    job.outputs.push_back(withLimit(20));
    job.outputs.push_back(withLimit(10));
    EXPECT_EQ(kareport::sizeLimit(job), 10);
    EXPECT_FALSE(kareport::isTooLarge(job, 10));
    EXPECT_TRUE(kareport::isTooLarge(job, 11));
}

TEST(LeastSize, ALineEndOfAReportMayBecomeOneByte)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    EXPECT_EQ(kareport::leastSize(report), 0);
    report.SetData(QStringLiteral("\r\n").repeated(3));
    EXPECT_EQ(kareport::leastSize(report), 3);
}

} // namespace
