#include "JobOutputs.h"
#include "ReportPages.h"

#include "ReportFixture.h"

#include <csignal>
#include <unistd.h>

#include <gtest/gtest.h>

namespace
{

/// Standard output is a pipe without a reader.
class NoReader
{
public:
    NoReader() : output_(dup(STDOUT_FILENO)), handler_(std::signal(SIGPIPE, SIG_IGN))
    {
        std::fflush(stdout);
        int ends[2] = {-1, -1};
        EXPECT_EQ(pipe(ends), 0);
        dup2(ends[1], STDOUT_FILENO);
        close(ends[0]);
        close(ends[1]);
    }
    ~NoReader()
    {
        dup2(output_, STDOUT_FILENO);
        close(output_);
        std::signal(SIGPIPE, handler_);
    }
    NoReader(const NoReader &) = delete;
    NoReader &operator=(const NoReader &) = delete;

private:
    int output_;
    void (*handler_)(int);
};

/// Remembers how far work has come.
class SeenProgress : public kareport::Progress
{
public:
    SeenProgress() : Progress(true) {}
    std::size_t last = 0;

private:
    void show(std::size_t done) override { last = done; }
};

TEST(JobOutputsReader, APdfWithoutAReaderIsNotMadeToItsEnd)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    report.SetPageSize();
    report.SetData(QStringLiteral("a line of a long report\r\n").repeated(300'000));
    SeenProgress progress;
    kareport::OutputResult result;
    {
        const NoReader noReader;
        result = kareport::writeOutput(report, {QStringLiteral("-"), kareport::OutputKind::Pdf}, progress);
    }
    EXPECT_TRUE(result.isReaderGone) << "there is no reader to be told";
    EXPECT_FALSE(result.isWritten());
    EXPECT_LT(progress.last, report.GetPages().size() / 2) << "work of seconds, shown a few times a second";
}

} // namespace
