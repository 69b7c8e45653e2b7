#include "UReportView.h"

#include "PrintFixture.h"

#include <QLabel>

#include <gtest/gtest.h>

namespace
{

TEST(UReportViewPageSetup, OkStoresMarginsAndOrientation)
{
    for (const bool portrait : {true, false}) {
        for (const bool modulePortrait : {true, false}) {
            AnsweredPrinting printing;
            ShownReport report;
            UReportView &view = report.open();
            SetReportPrinterSetToPortrait(!portrait);
            UPreviewDlg::SetModulePrinterOrientationPortrait(modulePortrait);
            report.report.SetMargins(QMargins(11, 22, 33, 44));
            printing.changeSetup = [portrait](kareport::PageSetup &setup) {
                setup.margins = QMargins(1525, 1001, 1200, 3000);
                setup.portrait = portrait;
            };
            view.OnPageSetup();
            ASSERT_EQ(printing.setups.size(), 1U);
            EXPECT_EQ(printing.setups[0].margins, QMargins(11, 22, 33, 44)) << "begins with the report's";
            EXPECT_EQ(printing.setups[0].portrait, !portrait) << "and the report's orientation";
            EXPECT_EQ(printing.portraitMeanwhile, !portrait);
            EXPECT_EQ(report.report.GetMargins(), QMargins(1525, 1001, 1200, 3000));
            EXPECT_EQ(IsReportPrinterSetToPortrait(), portrait);
            EXPECT_EQ(UPreviewDlg::IsModulePrinterOrientationPortrait(), modulePortrait) << "put back";
            UReportDoc next;
            next.LoadSettings();
            EXPECT_EQ(next.GetMargins(), QMargins(1525, 1001, 1200, 3000)) << "for later reports";
        }
    }
}

TEST(UReportViewPageSetup, OkMeasuresThePageWithTheNewMargins)
{
    AnsweredPrinting printing;
    ShownReport report;
    UReportView &view = report.open();
    report.report.SetPageSize();
    const int before = report.report.GetLinesPerPage();
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.margins.setBottom(15000); };
    view.OnPageSetup();
    EXPECT_LT(report.report.GetLinesPerPage(), before * 2 / 3);
}

TEST(UReportViewPageSetup, TheOpenReportIsTurnedWithItsNextPrint)
{
    AnsweredPrinting printing;
    ShownReport report(QStringLiteral("line\r\n").repeated(300));
    UReportView &view = report.open();
    UReportView &other = report.open();
    SetReportPrinterSetToPortrait(true);
    report.report.SetPageSize();
    const QSize upright = report.report.GetPageSize();
    const int lines = report.report.GetLinesPerPage();
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.portrait = false; };
    view.OnPageSetup();
    EXPECT_EQ(report.report.GetPageSize(), upright) << "it is measured before the orientation is kept";
    EXPECT_EQ(report.report.GetLinesPerPage(), lines);
    const QString shown = widgetOf(other).pageLabel().text();
    view.OnReportPrint();
    EXPECT_EQ(report.report.GetPageSize(), upright.transposed()) << "and by the next print command";
    EXPECT_LT(report.report.GetLinesPerPage(), lines);
    EXPECT_NE(widgetOf(other).pageLabel().text(), shown) << "each view shows at once how many pages there are";
}

TEST(UReportViewPageSetup, CancelChangesNothing)
{
    AnsweredPrinting printing;
    printing.accept = false;
    ShownReport report;
    UReportView &view = report.open();
    SetReportPrinterSetToPortrait(false);
    UPreviewDlg::SetModulePrinterOrientationPortrait(true);
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.margins = QMargins(); };
    report.report.SetMargins(QMargins(11, 22, 33, 44));
    view.OnPageSetup();
    EXPECT_EQ(printing.setups.size(), 1U);
    EXPECT_EQ(report.report.GetMargins(), QMargins(11, 22, 33, 44));
    EXPECT_FALSE(IsReportPrinterSetToPortrait());
    EXPECT_TRUE(UPreviewDlg::IsModulePrinterOrientationPortrait());
    UReportDoc next;
    next.LoadSettings();
    EXPECT_EQ(next.GetMargins(), QMargins(1000, 1000, 1200, 2000)) << "nothing was saved";
}

TEST(UReportViewPageSetup, SelectsThePrinter)
{
    AnsweredPrinting printing;
    ShownReport report;
    UReportView &view = report.open();
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.printer = QStringLiteral("Plotter"); };
    view.OnPageSetup();
    EXPECT_EQ(kareport::defaultPrinter().name, QStringLiteral("Plotter"));
    printing.accept = false;
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.printer = QStringLiteral("Other"); };
    view.OnPageSetup();
    EXPECT_EQ(kareport::defaultPrinter().name, QStringLiteral("Plotter"));
}

TEST(UReportViewPageSetup, EveryViewOfTheReportShowsTheNewPagesAtOnce)
{
    AnsweredPrinting printing;
    ShownReport report;
    writeLines(report.report, 200);
    UReportView &view = report.open();
    UReportView &other = report.open();
    QCoreApplication::processEvents();
    const QString before = widgetOf(other).pageLabel().text();
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.margins.setBottom(20000); };
    view.OnPageSetup();
    EXPECT_NE(widgetOf(view).pageLabel().text(), before);
    EXPECT_EQ(widgetOf(other).pageLabel().text(), widgetOf(view).pageLabel().text());
}

} // namespace
