#include "UReportView.h"

#include "PageHeader.h"
#include "PdfReadBack.h"
#include "PrintFixture.h"
#include "ReportPages.h"
#include "RichTextReader.h"

#include <QFile>
#include <QTextBlock>

#include <gmock/gmock.h>

namespace
{

using kareport::PrintInfo;
using testing::ElementsAre;

PdfReadBack readBack(const QString &path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return PdfReadBack(file.readAll());
}

/// The first words of each sheet that is printed.
std::vector<std::string> firstLines(const PdfReadBack &pdf, qsizetype length)
{
    std::vector<std::string> lines;
    for (const QString &page : pdf.pages()) {
        lines.push_back(page.trimmed().left(length).toStdString());
    }
    return lines;
}

/// Pages of numbered lines under a heading "page N", as their writer lays them out: who ends the last line but one of a page
/// begins the next page.
void writePages(UReportDoc &report, int pages, int linesOfPage, int lines = 0)
{
    lines = lines > 0 ? lines : linesOfPage - 1;
    report.FixPage(linesOfPage, 80);
    report.SetHeaderFlag(false);
    for (int page = 1; page <= pages; ++page) {
        if (report.GetPageNumber() != page) {
            report.NewPage(-1);
        }
        report.WriteLine(QStringLiteral("page %1").arg(page), 0, 1, 0);
        for (int line = 2; line <= lines; ++line) {
            report.WriteLine(QStringLiteral("line %1 of page %2").arg(line).arg(page), 0, 1, 0);
        }
    }
}

struct SheetSize
{
    QPageSize::PageSizeId paper;
    bool portrait;
    QMargins margins;
};

TEST(UReportViewGivenPages, EachPageIsPrintedOnASheetOfItsOwn)
{
    constexpr QMargins usual(1000, 1000, 1200, 2000);
    struct Row
    {
        SheetSize sheet;
        int linesOfPage;
        int pages;
        int sheets;
        const char *reason;
    };
    const Row rows[] = {
        {{QPageSize::A4, true, usual}, 72, 5, 5, "A4 takes 80 lines: the page is 72 all the same"},
        {{QPageSize::Letter, true, usual}, 72, 5, 5, "Letter takes 75"},
        {{QPageSize::A4, false, usual}, 72, 5, 5, "A4 lying takes 54: smaller type"},
        {{QPageSize::Letter, false, usual}, 72, 5, 5, "Letter lying takes 56"},
        {{QPageSize::A4, true, {0, 0, 0, 0}}, 72, 5, 5, "no margins: 90 lines"},
        {{QPageSize::A4, true, {6000, 6000, 6000, 6000}}, 72, 5, 5, "wide margins: 53 lines, 84 of 5 points"},
        {{QPageSize::A5, true, usual}, 72, 5, 5, "A5 takes 54"},
        {{QPageSize::A6, true, usual}, 72, 5, 10, "A6 takes 35 lines, 56 of 5 points: two pieces"},
        {{QPageSize::A5, false, usual}, 100, 3, 6, "A5 lying takes 35, 57 of 5 points: two pieces"},
        {{QPageSize::A4, true, usual}, 128, 3, 3, "128 lines of 5 points"},
        {{QPageSize::A4, true, usual}, 20, 4, 4, "much less than a sheet"},
    };
    for (const Row &row : rows) {
        AnsweredPrinting printing;
        printing.changePrinter = [&row](QPrinter &printer) { printer.setPageSize(QPageSize(row.sheet.paper)); };
        ShownReport report;
        writePages(report.report, row.pages, row.linesOfPage);
        report.report.SetMargins(row.sheet.margins);
        SetReportPrinterSetToPortrait(row.sheet.portrait);
        report.open().OnReportPrint();
        const PdfReadBack pdf = readBack(printing.file());
        EXPECT_EQ(pdf.pageCount(), row.sheets) << row.reason;
        std::vector<std::string> begins;
        for (const QString &page : pdf.pages()) {
            if (page.trimmed().startsWith(QStringLiteral("page"))) {
                begins.push_back(page.trimmed().section(u'\n', 0, 0).toStdString());
            }
            EXPECT_EQ(page.count(QStringLiteral("page "), Qt::CaseSensitive), page.trimmed().count(u'\n') + 1)
                << "nothing of another page; " << row.reason;
        }
        ASSERT_EQ(begins.size(), static_cast<std::size_t>(row.pages)) << row.reason;
        for (int page = 1; page <= row.pages; ++page) {
            EXPECT_EQ(begins.at(static_cast<std::size_t>(page) - 1), "page " + std::to_string(page)) << row.reason;
            const QString last = QStringLiteral("line %1 of page %2").arg(row.linesOfPage - 1).arg(page);
            EXPECT_TRUE(pdf.pages().join(u'\f').contains(last)) << row.reason;
        }
        SetReportPrinterSetToPortrait(true);
    }
}

TEST(UReportViewGivenPages, TheSheetsAreThePagesThatAreOffered)
{
    struct Row
    {
        QMargins margins;
        int sheets;
        const char *reason;
    };
    constexpr Row rows[] = {
        {{1000, 1000, 1200, 2000}, 5, "a sheet a page"},
        {{1000, 10000, 1200, 10000}, 10, "97 mm take 46 lines of 5 points: two pieces each"},
    };
    for (const Row &row : rows) {
        AnsweredPrinting printing;
        ShownReport report;
        writePages(report.report, 5, 72);
        report.report.SetMargins(row.margins);
        report.open().OnReportPrint();
        EXPECT_THAT(printing.maxPages, ElementsAre(row.sheets)) << row.reason;
        EXPECT_EQ(printing.printedPages(), row.sheets) << row.reason;
    }
}

TEST(UReportViewGivenPages, PagesArePrintedInAnyOrder)
{
    AnsweredPrinting printing;
    ShownReport report;
    writePages(report.report, 4, 40, 30);
    UReportView &view = report.open();
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setResolution(600);
    printer.setPageSize(QPageSize(QPageSize::A4));
    printer.setFullPage(true);
    report.report.SetPageSize();
    PrintInfo info;
    info.printer = &printer;
    ASSERT_TRUE(view.OnPreparePrinting(info));
    {
        QPainter painter(&printer);
        view.OnBeginPrinting(painter, info);
        EXPECT_EQ(info.maxPage, 4);
        info.curPage = 100;
        view.OnPrepareDC(painter, info);
        EXPECT_EQ(view.GetPageStarts().size(), 4U) << "there is no page 100";
        for (const int page : {3, 1, 3, 4}) {
            info.curPage = page;
            view.OnPrepareDC(painter, info);
            view.OnPrint(painter, info);
            EXPECT_EQ(info.maxPage, 4);
            if (page != 4) {
                printer.newPage();
            }
        }
        for (const int unknown : {0, -1, 5}) {
            info.curPage = unknown;
            EXPECT_THROW(view.OnPrint(painter, info), std::invalid_argument) << unknown;
        }
        view.OnEndPrinting(painter, info);
        painter.end();
    }
    EXPECT_THAT(firstLines(readBack(printing.file()), 6), ElementsAre("page 3", "page 1", "page 3", "page 4"));
}

TEST(UReportViewGivenPages, AJobThatIsPreparedAgainHasThePagesThatTheReportHasThen)
{
    ShownReport report;
    writePages(report.report, 4, 40, 30);
    UReportView &view = report.open();
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    PrintInfo info;
    info.printer = &printer;
    info.direct = true;
    report.report.SetPageSize();
    ASSERT_TRUE(view.OnPreparePrinting(info));
    EXPECT_EQ(info.maxPage, 4);
    // The job cannot begin on the printer, so that nothing ends it; the text stays, its third page is one with the last.
    std::vector<qint64> starts = report.report.GetPageStarts();
    starts.pop_back();
    report.report.SetPageStarts(starts);
    ASSERT_TRUE(view.OnPreparePrinting(info));
    EXPECT_EQ(info.maxPage, 3);
}

TEST(UReportViewGivenPages, RangesOrderAndCopiesAreTakenFromThePrinter)
{
    struct Row
    {
        std::function<void(QPrinter &)> set;
        std::vector<std::string> printed;
        const char *reason;
    };
    const Row rows[] = {
        {[](QPrinter &printer) { printer.setFromTo(2, 3); }, {"page 2", "page 3"}, "a range"},
        {[](QPrinter &printer) { printer.setFromTo(4, 9); }, {"page 4"}, "a range that ends after the last"},
        {[](QPrinter &printer) { printer.setPageOrder(QPrinter::LastPageFirst); },
         {"page 4", "page 3", "page 2", "page 1"},
         "the last first"},
        {[](QPrinter &printer) { printer.setPageRanges(QPageRanges::fromString(QStringLiteral("1,3-4"))); },
         {"page 1", "page 3", "page 4"},
         "several ranges"},
    };
    for (const Row &row : rows) {
        AnsweredPrinting printing;
        printing.changePrinter = row.set;
        ShownReport report;
        writePages(report.report, 4, 40, 30);
        report.open().OnReportPrint();
        EXPECT_THAT(printing.maxPages, ElementsAre(4)) << row.reason;
        EXPECT_EQ(firstLines(readBack(printing.file()), 6), row.printed) << row.reason;
    }
}

TEST(UReportViewGivenPages, ThePreviewShowsThePagesThatArePrinted)
{
    AnsweredPrinting printing;
    ShownReport report;
    writePages(report.report, 4, 72);
    SetReportPrinterSetToPortrait(false);
    report.open().OnReportPrintPreview();
    EXPECT_EQ(printing.previews, 1);
    EXPECT_THAT(firstLines(readBack(printing.file()), 6), ElementsAre("page 1", "page 2", "page 3", "page 4"));
}

TEST(UReportViewGivenPages, PageSetupSwitchesToTheMeasuredPageAndBack)
{
    AnsweredPrinting printing;
    ShownReport report;
    writePages(report.report, 3, 60);
    UReportView &view = report.open();
    bool keeps = false;
    printing.changeSetup = [&keeps](kareport::PageSetup &setup) { setup.keepsGivenPages = keeps; };
    view.OnPageSetup();
    EXPECT_TRUE(printing.setups.back().asksForPages);
    EXPECT_EQ(printing.setups.back().givenLines, 60);
    EXPECT_TRUE(printing.setups.back().keepsGivenPages);
    EXPECT_FALSE(report.report.IsPageFixed());
    EXPECT_EQ(report.report.GetLinesPerPage(), 80) << "what A4 takes";
    view.OnReportPrint();
    EXPECT_EQ(printing.maxPages.back(), 3) << "the end of each page is in the text: 180 lines of 80 are three sheets";
    EXPECT_THAT(firstLines(readBack(printing.file()), 16),
                ElementsAre("page 1\nline 2 of", "line 21 of page ", "line 41 of page "))
        << "from sheet to sheet";

    keeps = true;
    view.OnPageSetup();
    EXPECT_EQ(printing.setups.back().givenLines, 60);
    EXPECT_FALSE(printing.setups.back().keepsGivenPages);
    EXPECT_TRUE(report.report.IsPageFixed());
    EXPECT_EQ(report.report.GetLinesPerPage(), 60) << "the report's own";
    view.OnReportPrint();
    EXPECT_EQ(printing.maxPages.back(), 3);
    EXPECT_THAT(firstLines(readBack(printing.file()), 6), ElementsAre("page 1", "page 2", "page 3"));

    printing.accept = false;
    keeps = false;
    view.OnPageSetup();
    EXPECT_TRUE(report.report.IsPageFixed()) << "cancelled";
}

TEST(UReportViewGivenPages, AReportWithoutAGivenPageHasNothingToSwitchTo)
{
    AnsweredPrinting printing;
    ShownReport report;
    printing.changeSetup = [](kareport::PageSetup &setup) { setup.keepsGivenPages = true; };
    report.open().OnPageSetup();
    EXPECT_EQ(printing.setups.back().givenLines, std::nullopt);
    EXPECT_FALSE(printing.setups.back().keepsGivenPages);
    EXPECT_FALSE(report.report.IsPageFixed());
}

TEST(UReportViewGivenPages, AnEditKeepsThePagesOnTheirSheets)
{
    AnsweredPrinting printing;
    ShownReport report;
    writePages(report.report, 3, 60);
    UReportView &view = report.open();
    QTextCursor cursor(view.GetEdit().document());
    cursor.movePosition(QTextCursor::Down, QTextCursor::MoveAnchor, 10);
    cursor.insertText(QStringLiteral("another line\n").repeated(3));
    view.OnReportPrint();
    const PdfReadBack pdf = readBack(printing.file());
    EXPECT_THAT(firstLines(pdf, 6), ElementsAre("page 1", "page 2", "page 3"));
    EXPECT_TRUE(pdf.pages().at(0).contains(QStringLiteral("line 59 of page 1")))
        << "62 lines on the first sheet, in smaller type";
}

TEST(UReportViewGivenPages, WideLinesWideCharactersAndTabsStayOnTheirSheets)
{
    struct Row
    {
        QString line;
        int sheets;
        const char *reason;
    };
    const Row rows[] = {
        {QString(150, u'x'), 2, "wider than A4, which takes 111: smaller type"},
        {QString(500, u'x'), 2, "broken at 5 points: three rows, for which the sheet has room"},
        {QString(20'000, u'x'), 3, "113 rows"},
        {QString(60, QChar(0x6E2C)), 2, "wide characters"},
        {QStringLiteral("a\tb\t").repeated(9), 2, "tabs"},
        {QString::fromUtf16(u"שלום עולם"), 2, "from right to left"},
    };
    for (const Row &row : rows) {
        AnsweredPrinting printing;
        ShownReport report;
        writePages(report.report, 1, 60, 30);
        report.report.WriteLine(row.line, 0, 1, 0);
        report.report.NewPage(-1);
        report.report.WriteLine(QStringLiteral("page 2"), 0, 1, 0);
        report.open().OnReportPrint();
        const PdfReadBack pdf = readBack(printing.file());
        const std::vector<std::string> first = firstLines(pdf, 6);
        EXPECT_EQ(first.size(), static_cast<std::size_t>(row.sheets)) << row.reason;
        EXPECT_EQ(first.front(), "page 1") << row.reason;
        EXPECT_EQ(first.back(), "page 2") << row.reason;
        if (row.line.startsWith(u'x')) {
            EXPECT_EQ(pdf.characters().count(u'x'), row.line.size()) << "nothing is lost; " << row.reason;
        }
    }
}

TEST(UReportViewGivenPages, RichTextHasThePagesOfTheReport)
{
    AnsweredPrinting printing;
    ShownReport report;
    report.report.SetRTFDataFlag(true);
    writePages(report.report, 3, 60);
    UReportView &view = report.open();
    ASSERT_TRUE(view.ShowsFormats());
    view.OnReportPrint();
    EXPECT_THAT(firstLines(readBack(printing.file()), 6), ElementsAre("page 1", "page 2", "page 3"));
}

TEST(UReportViewGivenPages, EditedRichTextHasThePagesOfItsHeaders)
{
    AnsweredPrinting printing;
    ShownReport report;
    report.report.SetRTFDataFlag(true);
    report.report.FixPage(60, 80);
    report.report.SetTitle(QStringLiteral("Points"));
    report.report.SetHeaderFlag(true);
    for (int line = 0; line < 150; ++line) {
        report.report.WriteLine(QStringLiteral("line %1").arg(line), 0, 1, line % 4);
    }
    UReportView &view = report.open();
    ASSERT_TRUE(view.ShowsFormats());
    QTextCursor cursor(view.GetEdit().document());
    cursor.movePosition(QTextCursor::Down, QTextCursor::MoveAnchor, 10);
    cursor.insertText(QStringLiteral("another line\n").repeated(3));
    view.OnReportPrint();
    const QStringList sheets = readBack(printing.file()).pages();
    ASSERT_EQ(sheets.size(), 3);
    for (int page = 1; page <= 3; ++page) {
        const QString header = sheets.at(page - 1).trimmed().section(u'\n', 0, 0);
        EXPECT_TRUE(header.startsWith(QStringLiteral("TALVEN - Points"))) << header.toStdString();
        EXPECT_TRUE(header.endsWith(QString::number(page))) << header.toStdString();
    }
}

TEST(UReportViewGivenPages, LineEndsOfOneCharacterMoveNoPage)
{
    for (const QChar lineEnd : {QChar(u'\r'), QChar(QChar::ParagraphSeparator), QChar(QChar::LineSeparator)}) {
        AnsweredPrinting printing;
        ShownReport report;
        report.report.FixPage(12, 80);
        report.report.SetHeaderFlag(false);
        for (int page = 1; page <= 3; ++page) {
            if (page > 1) {
                report.report.NewPage(-1);
            }
            report.report.WriteLine(QStringLiteral("page %1").arg(page), 0, 1, 0);
            report.report.WriteLine(QStringLiteral("second") + lineEnd + QStringLiteral("third"), 0, 1, 0);
        }
        UReportView &view = report.open();
        for (int page = 1; page <= 3; ++page) {
            widgetOf(view).goToPage(page);
            EXPECT_EQ(view.GetEdit().textCursor().block().text(), QStringLiteral("page %1").arg(page))
                << int(lineEnd.unicode());
        }
        view.OnReportPrint();
        EXPECT_THAT(firstLines(readBack(printing.file()), 6), ElementsAre("page 1", "page 2", "page 3"))
            << int(lineEnd.unicode());
    }
}

TEST(UReportViewGivenPages, ABreakWithinALineOfEditedRichTextMovesNoPage)
{
    AnsweredPrinting printing;
    ShownReport report;
    const auto header = [](int page) {
        return kareport::pageHeaderLine(QStringLiteral("A"), QStringLiteral("T"),
                                        QDateTime(QDate(2024, 3, 5), QTime(14, 7)), QStringLiteral("   Page:"), 80) +
               QString::number(page);
    };
    QString source = QStringLiteral("{\\rtf1 ");
    for (int page = 1; page <= 3; ++page) {
        source += header(page) + QStringLiteral("\\par second\\line third\\par ");
    }
    report.report.SetData(source + u'}');
    report.report.FixPage(12, 80);
    UReportView &view = report.open();
    putCursor(view.GetEdit(), static_cast<int>(view.GetEdit().toPlainText().indexOf(QStringLiteral("third"))));
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    ASSERT_EQ(report.report.GetPages().size(), 3U);
    for (int page = 1; page <= 3; ++page) {
        widgetOf(view).goToPage(page);
        EXPECT_EQ(view.GetEdit().textCursor().block().text(), header(page));
    }
    view.OnReportPrint();
    const QStringList sheets = readBack(printing.file()).pages();
    ASSERT_EQ(sheets.size(), 3);
    for (int page = 1; page <= 3; ++page) {
        EXPECT_TRUE(sheets.at(page - 1).trimmed().section(u'\n', 0, 0).endsWith(QString::number(page))) << page;
    }
}

TEST(UReportViewGivenPages, AnImageThatWasBegunLateHasThePagesOfItsHeaders)
{
    AnsweredPrinting printing;
    ShownReport report;
    report.report.FixPage(20, 80);
    report.report.SetTitle(QStringLiteral("Points"));
    report.report.SetHeaderFlag(true);
    for (int line = 0; line < 30; ++line) {
        report.report.WriteLine(QStringLiteral("text %1").arg(line), 0, 1, 0);
    }
    report.report.SetRTFDataFlag(true);
    for (int line = 0; line < 50; ++line) {
        report.report.WriteLine(QStringLiteral("image %1").arg(line), 0, 1, 0);
    }
    UReportView &view = report.open();
    ASSERT_TRUE(view.ShowsFormats());
    view.OnReportPrint();
    const QStringList sheets = readBack(printing.file()).pages();
    ASSERT_GE(sheets.size(), 3);
    EXPECT_TRUE(sheets.at(0).trimmed().startsWith(QStringLiteral("image 0"))) << "the end of a page";
    EXPECT_EQ(sheets.size(), widgetOf(view).pageCount());
    for (const QString &sheet : sheets.sliced(1)) {
        EXPECT_TRUE(sheet.trimmed().startsWith(QStringLiteral("TALVEN - Points"))) << sheet.toStdString();
    }
}

TEST(UReportViewGivenPages, EmptyAndBlankReports)
{
    AnsweredPrinting printing;
    const AnsweredMessages messages(MessageAnswer::Ok);
    ShownReport report;
    report.report.FixPage(60, 80);
    UReportView &view = report.open();
    view.OnReportPrint();
    EXPECT_EQ(messages.texts.size(), 1) << "nothing to print";
    EXPECT_FALSE(QFile::exists(printing.file()));
    report.report.SetData(QStringLiteral("\r\n").repeated(200));
    view.UpdateData(true);
    view.OnReportPrint();
    EXPECT_EQ(printing.printedPages(), 1) << "blank lines are a blank sheet";
}

} // namespace
