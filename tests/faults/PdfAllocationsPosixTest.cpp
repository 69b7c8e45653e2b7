#include "ReportSubject.h"

#include "PdfExport.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

// What asks for less is fontconfig, which does not look whether it got it.
constexpr std::size_t beyondFontconfig = 8192;

TEST(PdfAllocations, APdfIsWrittenWholeOrItIsSaid)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    report.FixPage(20, 80);
    ASSERT_EQ(report.SetPageSize(), 1);
    report.SetHeaderFlag(true);
    for (int line = 0; line < 60; ++line) {
        report.WriteLine(QStringLiteral("%1 a line of a report, %2").arg(line).arg(line * 1.25), 0, 1, 0);
    }
    const QString text = report.CopyText();
    QBuffer whole;
    whole.open(QIODevice::WriteOnly);
    ASSERT_TRUE(report.WritePdf(whole));
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        QBuffer device;
        device.open(QIODevice::WriteOnly);
        kareport::PdfNotes notes;
        bool isWritten = false;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number, beyondFontconfig);
            EXPECT_NO_THROW(isWritten = report.WritePdf(device, &notes)) << number;
            hasFailed = failing.hasFailed();
        }
        EXPECT_EQ(isWritten, device.data() == whole.data()) << number << " of " << device.data().size();
        EXPECT_NE(isWritten, !notes.problem.isEmpty()) << number << ": " << notes.problem.toStdString();
        EXPECT_TRUE(report.CopyText() == text) << number;
        EXPECT_FALSE(report.HasLostText()) << number;
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GT(allocations, 10);
}

} // namespace
