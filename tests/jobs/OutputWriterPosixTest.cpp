#include "OutputWriter.h"

#include "ReportFixture.h"

#include <QBuffer>
#include <QElapsedTimer>

#include <csignal>
#include <unistd.h>

#include <gtest/gtest.h>

namespace
{

/// Standard output is a pipe that nobody reads.
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

TEST(OutputWriter, APdfThatNobodyReadsIsNotMadeToItsEnd)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    report.SetPageSize();
    report.SetData(QStringLiteral("a line of a long report\r\n").repeated(300'000));
    QElapsedTimer time;
    time.start();
    QBuffer whole;
    whole.open(QIODevice::WriteOnly);
    ASSERT_TRUE(report.WritePdf(whole));
    const qint64 wholeTime = time.restart();
    std::optional<QString> wrong;
    {
        const NoReader noReader;
        kareport::Progress progress(false);
        QStringList warnings;
        wrong = kareport::writeOutput(report, {QStringLiteral("-"), kareport::OutputKind::Pdf}, progress, warnings);
    }
    EXPECT_EQ(wrong, QString()) << "nobody is left to be told";
    EXPECT_LT(time.elapsed(), wholeTime / 2) << "of " << wholeTime << " ms";
}

} // namespace
