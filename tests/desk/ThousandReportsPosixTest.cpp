#include "DeskFixture.h"

#include "ReportWindowEntry.h"
#include "TestSize.h"
#include "UReportWindowDlg.h"

#include <gtest/gtest.h>

#include <malloc.h>

namespace
{

/// Bytes that are allocated now.
std::size_t allocated()
{
    return mallinfo2().uordblks;
}

/// What happens when windows and docks that have closed are taken away.
void settle()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

/// Opens and closes a report, in a pane or in a report window.
void openAndClose(bool inWindow, int number)
{
    const QString name = QStringLiteral("Report of run %1").arg(number);
    UReportDoc *report =
        inWindow ? CreateReportWindow(name, true, false) : CreateReport(name, true, false, nullptr, 0, nullptr);
    ASSERT_NE(report, nullptr);
    for (int line = 0; line < 50; ++line) {
        report->WriteLine(QStringLiteral("a line of a report that is opened and closed"), 0, 1, 0);
    }
    report->UpdateAllViews(nullptr);
    report->SetReportWindowActive();
    report->OnCloseDocument();
    settle();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << name.toStdString();
}

TEST(ThousandReports, LeaveNothingBehind)
{
    Desk desk;
    constexpr int warmUp = 100; // caches of fonts, styles and texts fill meanwhile
    const int reports = testSize(300, 1000);
    // Caches may still grow once, whatever the number of reports; a few hundred bytes a report would be seen.
    const std::size_t mostGrowth = 64 * 1024 + static_cast<std::size_t>(reports) * 192;
    std::size_t before = 0;
    for (int number = 0; number < warmUp + reports; ++number) {
        if (number == warmUp) {
            before = allocated();
        }
        openAndClose(number % 2 == 0, number);
    }
    EXPECT_LT(allocated(), before + mostGrowth);
    RecordProperty("grown_bytes", static_cast<int>(allocated()) - static_cast<int>(before));
    EXPECT_TRUE(Desk::reports().empty());
    QStringList captions;
    CViewPane::GetPaneCaptions(captions);
    EXPECT_EQ(captions, QStringList());
    EXPECT_TRUE(desk.frame->findChildren<QDockWidget *>().isEmpty());
}

} // namespace
