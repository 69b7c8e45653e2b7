#include "DeskFixture.h"

#include "CrashFolder.h"
#include "FrameFixture.h"
#include "PageBar.h"
#include "ReportEdit.h"
#include "ReportFixture.h"
#include "ReportPages.h"
#include "ReportViewWidget.h"
#include "SavedReports.h"
#include "StakeoutSheets.h"
#include "UReportView.h"

#include <QBuffer>
#include <QSpinBox>
#include <QTextBlock>

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

/// Goes to each page as a user does, with Ctrl+G and the number.
void expectPagesToGoTo(UReportView &view)
{
    auto &widget = *static_cast<kareport::ReportViewWidget *>(view.GetWidget());
    EXPECT_EQ(widget.pageCount(), pagesOfStakeout);
    for (int page = pagesOfStakeout; page >= 1; --page) {
        QTest::keyClick(&widget.edit(), Qt::Key_G, Qt::ControlModifier);
        ASSERT_TRUE(widget.pageBar().isVisibleTo(&widget));
        QTest::keyClicks(&widget.pageBar().page(), QString::number(page));
        QTest::keyClick(&widget.pageBar().page(), Qt::Key_Return);
        const QString line = widget.edit().textCursor().block().text();
        EXPECT_TRUE(line.startsWith(QStringLiteral("TALVEN Survey - Stakeout"))) << line.toStdString();
        EXPECT_EQ(line.section(QStringLiteral("Page:"), 1).trimmed(), QString::number(page));
        EXPECT_EQ(widget.currentPage(), page);
    }
}

/// What is printed of a report that was opened again, its PDF, and Go to Page have the pages of the job.
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
    expectPagesToGoTo(*view);
    expectStakeoutPrinted(*report, *view);
}

TEST(StakeoutAgain, ASavedListThatIsOpenedHasItsPagesOnSheetsInThePdfAndToGoTo)
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

TEST(StakeoutAgain, ARecoveredListHasItsPagesOnSheetsInThePdfAndToGoTo)
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
        {[](UReportDoc &report, const JobFolder &files) {
             EXPECT_TRUE(report.OnSaveDocument(files.path("a.rtf")));
             report.SetPathName(files.path("a.rtf"), false);
         },
         "its own file is rich text"},
        {[](UReportDoc &report, const JobFolder &files) {
             EXPECT_TRUE(report.OnSaveDocument(files.path("a.rtf")));
             report.SetPathName(files.path("a.rtf"), false);
             EXPECT_TRUE(report.ReplaceText(report.GetPageStarts().at(3) - 2, 0, u"x"));
         },
         "rich text, edited since"},
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
