// The sheets on the screen are those that are printed, and those of the PDF.
#include "SheetReport.h"

#include "PagedText.h"
#include "PdfReadBack.h"
#include "SheetLayout.h"

#include <QBuffer>
#include <QFile>

#include <gmock/gmock.h>

namespace
{

using kareport::PrintInfo;
using Shows = kareport::SheetReportView::Shows;

struct Page
{
    int linesOfPage; ///< 0 for lines that flow
    QMargins margins;
    bool portrait;
    const char *reason;
};

const Page pages[] = {
    {72, {1000, 1000, 1200, 2000}, true, "a page a sheet"},
    {72, {1000, 1000, 1200, 2000}, false, "smaller type on a sheet that lies"},
    {400, {1000, 1000, 1200, 2000}, true, "pages that continue on further sheets"},
    {0, {1000, 1000, 1200, 2000}, true, "lines that flow"},
    {0, {3000, 4000, 1200, 2000}, false, "the same with other margins, lying"},
};

void write(SheetReport &shown, const Page &page)
{
    SetReportPrinterSetToPortrait(page.portrait);
    shown.report.SetMargins(page.margins);
    shown.report.SetPageSize();
    if (page.linesOfPage > 0) {
        shown.writePages(3, page.linesOfPage);
    } else {
        writeLines(shown.report, 250);
        shown.report.UpdateAllViews(nullptr, 0, nullptr);
    }
}

TEST(SheetsPrinted, ASheetIsDrawnAsItIsPrinted)
{
    for (const Page &page : pages) {
        SCOPED_TRACE(page.reason);
        SheetReport shown;
        write(shown, page);
        shown.show(Shows::Sheets);
        kareport::SheetLayout *layout = shown.view().sheets().layout();
        ASSERT_NE(layout, nullptr);

        PrintInfo info;
        info.preview = true;
        ASSERT_TRUE(shown.view().OnPreparePrinting(info));
        int printed = 0;
        const auto drawPage = [&](QPainter &painter, int number) {
            info.curPage = number;
            shown.view().OnBeginPrinting(painter, info);
            shown.view().OnPrepareDC(painter, info);
            const bool isThere = static_cast<int>(shown.view().GetPageStarts().size()) >= number;
            if (isThere) {
                shown.view().OnPrint(painter, info);
                ++printed;
            }
            shown.view().OnEndPrinting(painter, info);
        };
        for (int number = 1; number <= layout->count(); ++number) {
            const QImage onPaper = sheetImage(QSize(3000, 3000), [&](QPainter &painter) { drawPage(painter, number); });
            const QImage onScreen =
                sheetImage(QSize(3000, 3000), [&](QPainter &painter) { layout->draw(painter, number - 1); });
            ASSERT_EQ(onScreen, onPaper) << "sheet " << number;
        }
        sheetImage(QSize(3000, 3000), [&](QPainter &painter) { drawPage(painter, layout->count() + 1); });
        EXPECT_EQ(printed, layout->count()) << "there is no sheet more on paper";
        EXPECT_GT(printed, 2);
    }
}

TEST(SheetsPrinted, ThereAreAsManyAsAPrinterPrints)
{
    for (const Page &page : pages) {
        SCOPED_TRACE(page.reason);
        AnsweredPrinting printing;
        SheetReport shown;
        write(shown, page);
        shown.show(Shows::Sheets);
        shown.view().OnReportPrint();
        EXPECT_EQ(shown.sheets().count(), printing.printedPages());
    }
}

TEST(SheetsPrinted, EachHasTheTextOfItsPageOfThePdf)
{
    SheetReport shown;
    shown.writePages(4, 72);
    shown.show(Shows::Sheets);
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    ASSERT_TRUE(shown.report.WritePdf(pdf));
    const QStringList ofPdf = PdfReadBack(pdf.data()).pages();
    const kareport::SheetLayout *layout = shown.view().sheets().layout();
    ASSERT_EQ(layout->count(), ofPdf.size());
    const QString text = shown.edit().document()->toPlainText();
    for (int sheet = 0; sheet < layout->count(); ++sheet) {
        const kareport::PrintSheet &place = layout->sheets()[static_cast<std::size_t>(sheet)];
        EXPECT_EQ(text.mid(place.start, place.stop - place.start).simplified(), ofPdf[sheet].simplified());
    }
}

TEST(SheetsPrinted, ASelectionIsPrintedAloneFromTheTopOfASheet)
{
    struct Row
    {
        int linesOfPage; ///< 0 for lines that flow
        int first;       ///< line, from 0
        int last;
        bool toNextLine; ///< whether the selection ends at the beginning of the next line
        int sheets;
        const char *reason;
    };
    const Row rows[] = {
        {0, 2, 4, false, 1, "some lines"},
        {0, 2, 4, true, 1, "up to a line's beginning: that line is not printed"},
        {0, 7, 7, false, 1, "a part of a line: all of it"},
        {0, 10, 200, false, 3, "more than a sheet takes"},
        {40, 30, 50, false, 1, "across two pages that have sheets of their own"},
    };
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        AnsweredPrinting printing;
        SheetReport shown;
        write(shown, {row.linesOfPage, {1000, 1000, 1200, 2000}, true, ""});
        const QTextDocument &text = *shown.edit().document();
        const QTextBlock last = text.findBlockByNumber(row.last);
        QStringList wanted;
        for (int line = row.first; line <= row.last; ++line) {
            wanted.append(text.findBlockByNumber(line).text());
        }
        putCursor(shown.edit(), row.toNextLine ? last.next().position() : last.position() + 1,
                  text.findBlockByNumber(row.first).position());
        shown.view().OnPrintSelection();
        ASSERT_EQ(printing.prints, 1);
        QFile file(printing.file());
        ASSERT_TRUE(file.open(QIODevice::ReadOnly));
        const PdfReadBack pdf(file.readAll());
        EXPECT_EQ(pdf.pageCount(), row.sheets);
        EXPECT_EQ(pdf.pages().join(u' ').simplified(), wanted.join(u' ').simplified());
        EXPECT_LT(pdf.words().front().top, 60) << "at the top, not where it is on its page";
    }
    AnsweredPrinting printing;
    SheetReport shown;
    write(shown, pages[0]);
    shown.view().OnPrintSelection();
    EXPECT_EQ(printing.prints, 0) << "without a selection";
}

} // namespace
