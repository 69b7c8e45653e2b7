#include "StakeoutSheets.h"

#include "PdfReadBack.h"
#include "PrintFixture.h"

#include <QFile>
#include <QPageSize>

#include <string>

void expectStakeoutPages(const QByteArray &pdf, const char *reason)
{
    const QStringList sheets = PdfReadBack(pdf).pages();
    ASSERT_EQ(sheets.size(), pagesOfStakeout) << reason;
    for (qsizetype i = 0; i < sheets.size(); ++i) {
        const QString header = sheets[i].trimmed().section(u'\n', 0, 0);
        EXPECT_TRUE(header.startsWith(QStringLiteral("TALVEN Survey - Stakeout"))) << header.toStdString() << reason;
        EXPECT_EQ(header.section(QStringLiteral("Page:"), 1).trimmed(), QString::number(i + 1)) << reason;
        EXPECT_EQ(sheets[i].count(QStringLiteral("Page:")), 1) << "no header of another page; " << reason;
    }
}

void expectStakeoutSheets(const QString &path, const char *reason)
{
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString() << "; " << reason;
    expectStakeoutPages(file.readAll(), reason);
}

void expectStakeoutPrinted(UReportDoc &report, UReportView &view)
{
    struct Row
    {
        QPageSize::PageSizeId paper;
        bool portrait;
        QMargins margins;
        const char *reason;
    };
    constexpr QMargins usual(1000, 1000, 1200, 2000);
    const Row rows[] = {
        {QPageSize::A4, true, usual, "A4 takes 80 lines, the page has 72"},
        {QPageSize::Letter, true, usual, "Letter takes 75"},
        {QPageSize::A4, false, usual, "A4 lying takes 54"},
        {QPageSize::Letter, false, usual, "Letter lying takes 56"},
        {QPageSize::A4, true, {100, 100, 100, 100}, "small margins take 89"},
        {QPageSize::A4, true, {3000, 4000, 3000, 4000}, "wide margins take 65, and 89 characters of 102"},
    };
    for (const Row &row : rows) {
        AnsweredPrinting printing;
        printing.changePrinter = [&row](QPrinter &printer) { printer.setPageSize(QPageSize(row.paper)); };
        SetReportPrinterSetToPortrait(row.portrait);
        report.SetMargins(row.margins);
        view.OnReportPrint();
        expectStakeoutSheets(printing.file(), row.reason);
        if (row.paper == QPageSize::A4) { // which the preview shows unless another sheet is chosen in it
            QFile::remove(printing.file());
            view.OnReportPrintPreview();
            EXPECT_EQ(printing.previews, 1);
            expectStakeoutSheets(printing.file(), row.reason);
        }
        SetReportPrinterSetToPortrait(true);
    }
}
