#include "UReportView.h"

#include "PdfReadBack.h"
#include "PrintFixture.h"
#include "PrintGeometry.h"
#include "PrivateCups.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

/// The sheet of a report's page, in twips.
QSize pageOf(const UReportDoc &report)
{
    return kareport::twipsOfDots(report.GetPageSize(), report.GetPrintResolution());
}

void expectSheet(const QSize &twips, const QSize &expected, const char *reason)
{
    EXPECT_NEAR(twips.width(), expected.width(), 15) << reason;
    EXPECT_NEAR(twips.height(), expected.height(), 15) << reason;
}

TEST(PageSetupPrinterPosix, TheSheetThatIsChosenIsMeasuredAndPrintedOn)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    constexpr QSize a4(11906, 16838);
    constexpr QSize a5(8391, 11906);
    AnsweredPrinting printing;
    ShownReport report;
    kareport::setDefaultPrinter({});
    writeLines(report.report, 70);
    UReportView &view = report.open();
    QSize chosen;
    printing.changeSetup = [&chosen](kareport::PageSetup &setup) {
        for (const kareport::PageSheet &sheet : setup.sheetsOf(setup.printer)) {
            if (QPageSize(sheet.points).id() == QPageSize::A5) {
                chosen = sheet.points;
            }
        }
        setup.sheet = chosen;
    };
    view.OnPageSetup();
    ASSERT_FALSE(chosen.isEmpty()) << "the printer takes A5";
    EXPECT_EQ(printing.setups[0].printer, QStringLiteral("Whole")) << "the system's";
    EXPECT_TRUE(printing.setups[0].sheet.isEmpty()) << "its own";
    EXPECT_EQ(kareport::defaultPrinter().name, QStringLiteral("Whole"));
    EXPECT_EQ(kareport::defaultPrinter().sheet, chosen);
    expectSheet(pageOf(report.report), a5, "measured");
    view.OnReportPrint(true);
    EXPECT_EQ(cups.arrivedPages(), 2) << "70 lines, of which A5 takes 53";
    QFile arrived(cups.arrived());
    ASSERT_TRUE(arrived.open(QIODevice::ReadOnly));
    const PdfReadBack pdf(arrived.readAll());
    EXPECT_TRUE(pdf.pageSize().endsWith(QStringLiteral("(A5)"))) << pdf.pageSize().toStdString();
    expectSheet(view.GetPaperSize(), a5, "printed on");

    printing.changeSetup = [](kareport::PageSetup &setup) { setup.sheet = QSize(); };
    view.OnPageSetup();
    EXPECT_EQ(printing.setups[1].sheet, chosen) << "begins with what was chosen";
    expectSheet(pageOf(report.report), a4, "the printer's own again");
    view.OnReportPrint(true);
    EXPECT_EQ(cups.arrivedPages(), 1);
}

} // namespace
