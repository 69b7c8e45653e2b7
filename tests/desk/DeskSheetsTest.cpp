#include "DeskSheets.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "DeskPreferences.h"
#include "PageMeasurement.h"
#include "PrintFixture.h"
#include "ReportPrinter.h"
#include "SheetPane.h"
#include "SheetView.h"

#include <QAction>
#include <QPageSize>
#include <QPrinterInfo>

#include <gtest/gtest.h>

namespace
{

using kareport::SheetReportView;
using Shows = SheetReportView::Shows;

/// Opens a report of some pages.
void openReport(Desk &desk, const JobFolder &folder, const char *name = "report.rep")
{
    folder.put(name, "\xEF\xBB\xBF" + QByteArray("a line of it\r\r\n").repeated(200));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
}

SheetReportView *viewInFront(Desk &desk)
{
    return dynamic_cast<SheetReportView *>(desk.frame->GetActiveView());
}

QAction *actionOf(Desk &desk, unsigned command)
{
    desk.frame->UpdateCommands();
    return desk.frame->CommandAction(command);
}

TEST(DeskSheets, AreShownAndHiddenByTheirKeyAndStayForTheNextReport)
{
    const JobFolder folder;
    Desk desk;
    EXPECT_FALSE(actionOf(desk, kareport::viewSheetsCommand)->isEnabled()) << "without a report";
    openReport(desk, folder);
    ASSERT_NE(viewInFront(desk), nullptr);
    EXPECT_EQ(viewInFront(desk)->shows(), Shows::Text) << "at first";
    EXPECT_EQ(actionOf(desk, kareport::viewSheetsCommand)->shortcut(), QKeySequence(Qt::Key_F8));
    actionOf(desk, kareport::viewSheetsCommand)->trigger();
    EXPECT_EQ(viewInFront(desk)->shows(), Shows::Sheets);
    EXPECT_TRUE(actionOf(desk, kareport::viewSheetsCommand)->isChecked());
    viewInFront(desk)->sheets().finish();
    EXPECT_GT(viewInFront(desk)->sheets().pane().view().count(), 1);
    openReport(desk, folder, "other.rep");
    EXPECT_EQ(viewInFront(desk)->shows(), Shows::Sheets) << "as the user looks at reports";
    actionOf(desk, kareport::viewSheetsBesideCommand)->trigger();
    EXPECT_EQ(viewInFront(desk)->shows(), Shows::Both);
    actionOf(desk, kareport::viewSheetsBesideCommand)->trigger();
    EXPECT_EQ(viewInFront(desk)->shows(), Shows::Text);
    EXPECT_FALSE(actionOf(desk, kareport::fitPageCommand)->isEnabled()) << "a text fits no page";
}

TEST(DeskSheets, PageLinesAreShownInAllTextsWhenWanted)
{
    const JobFolder folder;
    Desk desk;
    openReport(desk, folder);
    kareport::ReportEdit &edit = viewInFront(desk)->GetEdit();
    viewInFront(desk)->GetDocument()->FixPage(10, 80);
    edit.viewport()->update();
    const QImage without = edit.viewport()->grab().toImage();
    actionOf(desk, kareport::viewPageLinesCommand)->trigger();
    const QImage with = edit.viewport()->grab().toImage();
    EXPECT_NE(with, without);
    QTextCursor cursor(edit.document()->findBlockByNumber(10));
    const int y = edit.cursorRect(cursor).top();
    int changed = 0;
    for (int x = 0; x < with.width(); ++x) {
        changed += with.pixel(x, y) != without.pixel(x, y) ? 1 : 0;
    }
    EXPECT_GT(changed, with.width() / 4) << "a line before the first line of page 2";
    const QRect firstPage(0, 0, with.width(), y - 2);
    EXPECT_EQ(with.copy(firstPage), without.copy(firstPage)) << "and none before";
    EXPECT_TRUE(kareport::loadSheetChoices().pageLines);
    actionOf(desk, kareport::viewPageLinesCommand)->trigger();
    EXPECT_EQ(edit.viewport()->grab().toImage(), without);
}

TEST(DeskSheets, ASelectionCanBePrinted)
{
    const JobFolder folder;
    Desk desk;
    AnsweredPrinting printing;
    openReport(desk, folder);
    EXPECT_FALSE(actionOf(desk, kareport::printSelectionCommand)->isEnabled()) << "nothing is selected";
    viewInFront(desk)->GetEdit().selectAll();
    EXPECT_TRUE(actionOf(desk, kareport::printSelectionCommand)->isEnabled());
    actionOf(desk, kareport::printSelectionCommand)->trigger();
    EXPECT_EQ(printing.prints, 1);
    EXPECT_GT(printing.printedPages(), 1);
}

TEST(DeskSheets, WithoutAPrinterReportsAreStillPreviewedSetUpAndPrintedIntoAPdf)
{
    const JobFolder folder;
    Desk desk;
    if (kareport::hasReportPrinter() && !kareport::applicationPrinter().isNull()) {
        GTEST_SKIP() << "this machine has a printer";
    }
    AnsweredPrinting printing;
    openReport(desk, folder);
    UReportDoc &report = *viewInFront(desk)->GetDocument();
    viewInFront(desk)->OnReportPrintPreview();
    EXPECT_EQ(printing.previews, 1);
    EXPECT_GT(printing.printedPages(), 1);
    viewInFront(desk)->OnReportPrint();
    EXPECT_EQ(printing.prints, 1);
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.sheet = QPageSize(QPageSize::A3).sizePoints(); };
    viewInFront(desk)->OnPageSetup();
    ASSERT_EQ(printing.setups.size(), 1U);
    const std::vector<kareport::PageSheet> sheets = printing.setups.front().sheetsOf(QString());
    ASSERT_EQ(sheets.size(), 4U);
    EXPECT_EQ(sheets.front().name, QStringLiteral("A4")) << "the country's first";
    EXPECT_EQ(qRound(report.GetPageSize().width() * 25.4 / report.GetPrintResolution()), 297) << "A3 from now on";
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
}

TEST(DeskSheets, ThePaperOfThePreferencesIsThatOfReportsAndJobs)
{
    Desk desk;
    kareport::DeskPreferences preferences = kareport::loadPreferences();
    EXPECT_TRUE(preferences.paper.isEmpty()) << "the country's";
    preferences.paper = QPageSize(QPageSize::Legal).sizePoints();
    preferences.inInches = true;
    kareport::savePreferences(preferences);
    EXPECT_EQ(kareport::loadPreferences().paper, preferences.paper);
    EXPECT_TRUE(kareport::loadPreferences().inInches);
    kareport::usePaper(preferences);
    UReportDoc report;
    report.SetAutoDelete(false);
    report.SetPageSize();
    if (kareport::applicationPrinter().isNull()) {
        EXPECT_EQ(qRound(report.GetPageSize().height() * 25.4 / report.GetPrintResolution()), 356);
    }
    const kareport::DefaultPrinter ofJobs = preferences.jobDefaults().page.printer;
    EXPECT_EQ(kareport::builtInSheet(ofJobs).id(), QPageSize::Legal);
    preferences.paper = QSize();
    EXPECT_EQ(kareport::builtInSheet(preferences.jobDefaults().page.printer).id(), QPageSize::A4);
}

} // namespace
