#include "DeskFixture.h"

#include "CrashFolder.h"
#include "FrameFixture.h"
#include "ReportFixture.h"
#include "ReportPages.h"
#include "SavedReports.h"
#include "StakeoutSheets.h"
#include "UReportView.h"

#include <QBuffer>

#include <gtest/gtest.h>

#include <functional>
#include <memory>

// A report whose page a job has fixed, after it was saved or kept, and opened again in a desk that knows nothing of the job.

namespace
{

UReportDoc *runStakeout(Desk &desk)
{
    EXPECT_TRUE(desk.frame->OpenFile(QStringLiteral(KAREPORT_EXAMPLES_DIR "/stakeout.json")));
    return Desk::reports().empty() ? nullptr : Desk::reports().front();
}

/// What is printed of a report that was opened again, and its PDF, have the pages of the job.
void expectPagesOfTheJob(UReportDoc *report)
{
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(report->IsPageFixed());
    EXPECT_EQ(report->GetLinesPerPage(), 72);
    EXPECT_EQ(report->GetPages().size(), std::size_t(pagesOfStakeout));
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    ASSERT_TRUE(report->WritePdf(pdf));
    expectStakeoutPages(pdf.data(), "the PDF");
    auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
    ASSERT_NE(view, nullptr);
    expectStakeoutPrinted(*report, *view);
}

TEST(StakeoutAgain, ASavedListThatIsOpenedHasItsPagesOnSheetsAndInThePdf)
{
    const FixedSurroundings surroundings; // with a printer
    for (const char *name : {"a.rep", "a.rtf"}) {
        SCOPED_TRACE(name);
        const JobFolder files;
        {
            Desk desk;
            UReportDoc *report = runStakeout(desk);
            ASSERT_NE(report, nullptr);
            EXPECT_TRUE(report->OnSaveDocument(files.path(name)));
            report->SetModifiedFlag(false);
        }
        Desk desk;
        desk.answer = MessageAnswer::No;
        ASSERT_TRUE(desk.frame->OpenFile(files.path(name)));
        EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.value(0).toStdString();
        expectPagesOfTheJob(Desk::reports().front());
    }
}

TEST(StakeoutAgain, ARecoveredListHasItsPagesOnSheetsAndInThePdf)
{
    struct Row
    {
        std::function<void(UReportDoc &report, const JobFolder &files)> prepare;
        const char *reason;
    };
    const FixedSurroundings surroundings;
    const Row rows[] = {
        {[](UReportDoc &, const JobFolder &) {}, "never saved"},
        {[](UReportDoc &report, const JobFolder &files) {
             EXPECT_TRUE(report.OnSaveDocument(files.path("a.rep")));
             report.SetPathName(files.path("a.rep"), false);
         },
         "its own file holds all of it"},
        {[](UReportDoc &report, const JobFolder &files) {
             EXPECT_TRUE(report.OnSaveDocument(files.path("a.rep")));
             report.SetPathName(files.path("a.rep"), false);
             EXPECT_TRUE(report.ReplaceText(report.GetPageStarts().at(3) - 2, 0, u"x"));
         },
         "edited since"},
    };
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        const JobFolder files;
        const CrashFolder folder;
        {
            Desk desk;
            desk.answer = MessageAnswer::No;
            auto recovery = std::make_unique<kareport::Recovery>(folder.path());
            UReportDoc *report = runStakeout(desk);
            ASSERT_NE(report, nullptr);
            row.prepare(*report, files);
            EXPECT_TRUE(recovery->keep());
            folder.crash(std::move(recovery));
        }
        Desk desk;
        desk.answer = MessageAnswer::No;
        kareport::Recovery recovery(folder.path());
        ASSERT_EQ(recovery.leftReports().size(), 1U);
        expectPagesOfTheJob(kareport::reopenReport(recovery.leftReports().front()));
        recovery.discardLeft();
    }
}

} // namespace
