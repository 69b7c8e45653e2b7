#include "UReportView.h"

#include "PdfReadBack.h"
#include "PrintFixture.h"

#include <QFile>

#include <gmock/gmock.h>

#include <stdexcept>

namespace
{

using kareport::PrintInfo;
using testing::ElementsAre;
using testing::IsEmpty;

/// A view whose page has been prepared for a printer into a file, without a window.
class PreparedView
{
public:
    explicit PreparedView(int lines, const QMargins &margins = {1000, 1000, 1200, 2000})
    {
        report.report.SetMargins(margins);
        report.report.SetPageSize();
        writeLines(report.report, lines);
        view = &report.open();
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(printing.file());
        printer.setResolution(600);
        printer.setPageSize(QPageSize(QPageSize::A4));
        printer.setFullPage(true);
        info.printer = &printer;
        EXPECT_TRUE(view->OnPreparePrinting(info));
    }

    AnsweredPrinting printing;
    ShownReport report;
    UReportView *view;
    QPrinter printer{QPrinter::HighResolution};
    PrintInfo info;
};

TEST(UReportViewPrint, PreparingSetsPaperMarginsAndPages)
{
    constexpr QMargins usual(1000, 1000, 1200, 2000);
    constexpr QMargins seventyTwo(1000, 1000, 1200, 4642); // lines of 78 dots
    constexpr QMargins usualTwips(567, 567, 680, 1134);
    constexpr QMargins lowerTwips(567, 567, 680, 2632);
    struct Row
    {
        int lines;
        QMargins margins;
        QMargins twips;
        int pages;
        const char *reason;
    };
    const Row rows[] = {
        {0, usual, usualTwips, 0, "nothing"},
        {1, usual, usualTwips, 1, "a line"},
        {80, usual, usualTwips, 1, "a page of 80 lines"},
        {81, usual, usualTwips, 2, "a line more"},
        {72, seventyTwo, lowerTwips, 1, "a page of 72 lines"},
        {73, seventyTwo, lowerTwips, 2, "a line more than that"},
    };
    for (const Row &row : rows) {
        const PreparedView prepared(row.lines, row.margins);
        EXPECT_EQ(prepared.info.maxPage, row.pages) << row.reason;
        EXPECT_THAT(prepared.printing.maxPages, ElementsAre(row.pages)) << "offered to the user; " << row.reason;
        EXPECT_EQ(prepared.view->GetPrintMargins(), row.twips) << row.reason;
        EXPECT_EQ(prepared.view->GetPaperSize(), QSize(11906, 16838)) << "A4; " << row.reason;
        EXPECT_EQ(prepared.info.printer, &prepared.printer) << "a printer that is there is kept; " << row.reason;
    }
}

TEST(UReportViewPrint, ThePageStartTableGrowsByThePagesThatArePrinted)
{
    PreparedView prepared(200);
    UReportView &view = *prepared.view;
    PrintInfo &info = prepared.info;
    QPainter painter(&prepared.printer);
    view.OnBeginPrinting(painter, info);
    EXPECT_THAT(view.GetPageStarts(), ElementsAre(0));
    EXPECT_EQ(info.maxPage, 3);

    view.OnPrint(painter, info);
    ASSERT_EQ(view.GetPageStarts().size(), 2U) << "the start of page 2";
    const qint64 second = view.GetPageStarts()[1];
    EXPECT_EQ(view.PrintPage(painter, 0, -1), second);
    EXPECT_EQ(info.maxPage, 3) << "more text follows";

    view.OnPrint(painter, info);
    EXPECT_THAT(view.GetPageStarts(), ElementsAre(0, second)) << "a page out of order adds nothing";
    info.curPage = 2;
    view.OnPrint(painter, info);
    ASSERT_EQ(view.GetPageStarts().size(), 3U);

    info.curPage = 3;
    info.maxPage = 9;
    view.OnPrint(painter, info);
    EXPECT_EQ(info.maxPage, 3) << "the text ends inside this page";
    EXPECT_EQ(view.GetPageStarts().size(), 3U) << "no page after the last";

    for (const int unknown : {0, -1, 4, 100}) {
        info.curPage = unknown;
        EXPECT_THROW(view.OnPrint(painter, info), std::invalid_argument) << unknown;
    }
    EXPECT_EQ(info.maxPage, 3);
    view.OnEndPrinting(painter, info);
    EXPECT_THAT(view.GetPageStarts(), IsEmpty());
}

TEST(UReportViewPrint, APageIsFoundBeforeThoseInFrontOfItArePrinted)
{
    PreparedView prepared(400);
    UReportView &view = *prepared.view;
    QPainter painter(&prepared.printer);
    view.OnBeginPrinting(painter, prepared.info);
    prepared.info.curPage = 4;
    view.OnPrepareDC(painter, prepared.info);
    EXPECT_EQ(view.GetPageStarts().size(), 4U);
    prepared.info.curPage = 100;
    view.OnPrepareDC(painter, prepared.info);
    EXPECT_EQ(view.GetPageStarts().size(), 5U) << "80 lines a page";
    EXPECT_EQ(prepared.info.maxPage, 5) << "there is no page 100";
}

TEST(UReportViewPrint, PrintsAPartOfTheText)
{
    PreparedView prepared(10);
    QPainter painter(&prepared.printer);
    EXPECT_EQ(prepared.view->PrintPage(painter, 0, 7), 7);
    EXPECT_EQ(prepared.view->PrintPage(painter, 7, 14), 14);
    EXPECT_EQ(prepared.view->PrintPage(painter, 0, -1), 71) << "9 lines of 7 characters and one of 8, with their ends";
    QPainter idle;
    EXPECT_EQ(prepared.view->PrintPage(idle, 3, -1), 3) << "nothing to paint on";
}

TEST(UReportViewPrint, PrintsTheWholeReport)
{
    struct Row
    {
        int lines;
        int pages;
        const char *reason;
    };
    // 80 lines of 8 points fit the usual page.
    for (const Row &row :
         {Row{1, 1, "a line"}, Row{80, 1, "a full page"}, Row{81, 2, "a line more"}, Row{800, 10, "ten pages"}})
    {
        const AnsweredPrinting printing;
        const AnsweredMessages messages(MessageAnswer::Ok);
        ShownReport report;
        writeLines(report.report, row.lines);
        report.open().OnReportPrint();
        EXPECT_EQ(printing.printedPages(), row.pages) << row.reason;
        EXPECT_THAT(messages.texts, IsEmpty()) << row.reason;
    }
}

TEST(UReportViewPrint, LongLinesTakePagesThatWereNotCounted)
{
    const AnsweredPrinting printing;
    ShownReport report;
    report.report.SetHeaderFlag(false);
    for (int i = 0; i < 60; ++i) {
        report.report.Write(QString(300, u'x') + QStringLiteral("\r\n"), 0);
    }
    report.open().OnReportPrint();
    EXPECT_THAT(printing.maxPages, ElementsAre(1));
    EXPECT_EQ(printing.printedPages(), 3) << "180 rows: nothing is lost";
}

TEST(UReportViewPrint, PrintingUsesTheReportsOrientationAndPutsTheModulesBack)
{
    for (const bool reportPortrait : {true, false}) {
        for (const bool modulePortrait : {true, false}) {
            for (const bool accept : {true, false}) {
                AnsweredPrinting printing;
                printing.accept = accept;
                ShownReport report;
                writeLines(report.report, 3);
                UReportView &view = report.open();
                SetReportPrinterSetToPortrait(reportPortrait);
                UPreviewDlg::SetModulePrinterOrientationPortrait(modulePortrait);
                view.OnReportPrint();
                EXPECT_EQ(printing.portraitMeanwhile, reportPortrait);
                EXPECT_EQ(printing.orientation, reportPortrait ? QPageLayout::Portrait : QPageLayout::Landscape);
                EXPECT_EQ(view.GetPaperSize().height() > view.GetPaperSize().width(), reportPortrait)
                    << "the page model matches the printer";
                EXPECT_EQ(QFile::exists(printing.file()), accept);
                EXPECT_EQ(UPreviewDlg::IsModulePrinterOrientationPortrait(), modulePortrait);
                view.OnReportPrintPreview();
                EXPECT_EQ(printing.previews, 1);
                EXPECT_EQ(printing.portraitMeanwhile, reportPortrait);
                EXPECT_EQ(UPreviewDlg::IsModulePrinterOrientationPortrait(), modulePortrait);
                EXPECT_EQ(IsReportPrinterSetToPortrait(), reportPortrait) << "never changed by printing";
            }
        }
    }
}

TEST(UReportViewPrint, ThePreviewAsksForNoPrinterAndShowsEveryPage)
{
    const AnsweredPrinting printing;
    ShownReport report;
    writeLines(report.report, 200);
    report.open().OnReportPrintPreview();
    EXPECT_EQ(printing.previews, 1);
    EXPECT_EQ(printing.prints, 0);
    EXPECT_EQ(printing.printedPages(), 3);
}

TEST(UReportViewPrint, AnotherSheetThatTheUserChoosesIsPrintedOn)
{
    AnsweredPrinting printing;
    printing.changePrinter = [](QPrinter &printer) { printer.setPageSize(QPageSize(QPageSize::A5)); };
    ShownReport report;
    writeLines(report.report, 80);
    report.open().OnReportPrint();
    EXPECT_EQ(printing.printedPages(), 2) << "210 mm are 53 lines high";
}

TEST(UReportViewPrint, ASheetWithoutRoomBetweenTheMarginsIsRefused)
{
    AnsweredPrinting printing;
    const AnsweredMessages messages(MessageAnswer::Ok);
    printing.changePrinter = [](QPrinter &printer) { printer.setPageSize(QPageSize(QPageSize::A6)); };
    ShownReport report;
    writeLines(report.report, 3);
    report.report.SetMargins(QMargins(6000, 1000, 6000, 1000)); // room on A4, none on A6
    UReportView &view = report.open();
    view.OnReportPrint();
    EXPECT_THAT(messages.texts,
                ElementsAre(testing::Truly([](const QString &text) { return text.contains(u"room"); })));
    EXPECT_EQ(printing.prints, 1) << "the sheet was chosen in the window that asks";
    EXPECT_FALSE(QFile::exists(printing.file()));
}

TEST(UReportViewPrint, APageThatTakesNothingIsNotFollowedByOthers)
{
    PreparedView prepared(3);
    UReportView &view = *prepared.view;
    prepared.report.report.SetMargins(QMargins(11000, 1000, 11000, 1000));
    EXPECT_FALSE(view.OnPreparePrinting(prepared.info));
    QPainter painter(&prepared.printer);
    view.OnBeginPrinting(painter, prepared.info);
    view.OnPrint(painter, prepared.info);
    EXPECT_THAT(view.GetPageStarts(), ElementsAre(0));
}

TEST(UReportViewPrint, ThePrintedTextIsAtTheMarginsInItsSize)
{
    struct Row
    {
        QMargins margins; ///< hundredths of a millimetre
        int fixedLines;   ///< of the page; 0 for a measured page
        double left;      ///< points
        double top;
        double size; ///< of the type
        const char *reason;
    };
    const Row rows[] = {
        {{1000, 1000, 1200, 2000}, 0, 28.35, 28.35, 8, "567 twips, type of 8 points"},
        {{2540, 5080, 1200, 2000}, 0, 72, 144, 8, "an inch, and two"},
        {{1000, 1000, 1200, 2000}, 40, 28.35, 28.35, 8, "a given page that has room"},
        {{1000, 1000, 1200, 2000},
         120,
         28.35,
         28.35,
         5.37,
         "one of 120 lines, for which the sheet has room in smaller type"},
        {{2540, 5080, 1200, 2000}, 100, 72, 144, 5.46, "and at other margins"},
    };
    for (const Row &row : rows) {
        const AnsweredPrinting printing;
        ShownReport report;
        report.report.SetMargins(row.margins);
        if (row.fixedLines > 0) {
            report.report.FixPage(row.fixedLines, 80);
        }
        writeLines(report.report, std::max(3, row.fixedLines));
        report.open().OnReportPrint();
        QFile file(printing.file());
        ASSERT_TRUE(file.open(QIODevice::ReadOnly)) << row.reason;
        const PdfReadBack pdf(file.readAll());
        EXPECT_EQ(pdf.pageCount(), 1) << row.reason;
        const std::vector<PdfWord> words = pdf.words();
        ASSERT_GE(words.size(), 4U) << row.reason;
        EXPECT_EQ(words[0].text, QStringLiteral("line")) << row.reason;
        EXPECT_NEAR(words[0].left, row.left, 0.2) << row.reason;
        EXPECT_NEAR(words[0].top, row.top, 1.0) << row.reason;
        constexpr double cell = 0.602; // of the type's size
        EXPECT_NEAR((words[1].left - words[0].left) / 5 / cell, row.size, 0.05) << row.reason;
        EXPECT_EQ(words[2].text, QStringLiteral("line")) << row.reason;
        EXPECT_NEAR(words[2].left, row.left, 0.2) << row.reason;
        EXPECT_NEAR((words[2].top - words[0].top) / row.size, 1.17, 0.02) << "the next line; " << row.reason;
    }
}

TEST(UReportViewPrint, MarginsAreDrawnAroundThePrintedText)
{
    PreparedView prepared(3, QMargins(2540, 5080, 2540, 15240));
    {
        QPainter painter(&prepared.printer);
        prepared.view->DrawMargins(painter);
        QPainter idle;
        prepared.view->DrawMargins(idle);
    }
    QFile file(prepared.printing.file());
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const std::vector<PdfWord> words = PdfReadBack(file.readAll()).words();
    // A4 is 842 points high; 842 - 144 - 432 points are 26 rows of 10.
    ASSERT_EQ(words.size(), 26U);
    for (std::size_t i = 0; i < words.size(); ++i) {
        EXPECT_EQ(words[i].text, QStringLiteral("%1->>").arg(i));
        EXPECT_NEAR(words[i].left, 72, 0.2) << i;
        EXPECT_NEAR(words[i].top, 144 + 10.0 * static_cast<double>(i), 1.5) << i;
    }
}

} // namespace
