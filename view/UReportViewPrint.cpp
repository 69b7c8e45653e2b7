#include "PrintQuestions.h"
#include "UReportView.h"

#include "AppMessageBox.h"
#include "Preferences.h"
#include "PrintDialogs.h"
#include "PrintGeometry.h"
#include "PrintJob.h"
#include "PrintRun.h"
#include "ReportEdit.h"
#include "ReportOrientation.h"
#include "ReportPrinter.h"
#include "UPreviewDlg.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QPaintEngine>
#include <QPainter>
#include <QPrinter>
#include <QTextBlock>
#include <QTextDocument>

#include <memory>
#include <tuple>
#include <utility>

namespace
{

using kareport::PrintInfo;
using kareport::PrintOutcome;
using kareport::PrintResult;

/// A preview keeps its pages in memory.
constexpr int mostPreviewPages = 2000;

/// The text of a view as a job begins with it. View, control and text may be destroyed while a window is open.
class PrintedText
{
public:
    explicit PrintedText(UReportView &view)
        : view_(view.GetHandle()), text_(view.GetEdit().document()), revision_(text_->revision())
    {}

    bool isUnchanged() const
    {
        return isOpen() && text_ != nullptr && static_cast<UReportView *>(*view_)->GetEdit().document() == text_ &&
               text_->revision() == revision_;
    }
    /// Whether the view is still there. Its widget does not tell: it may outlive the view.
    bool isOpen() const { return *view_ != nullptr; }

private:
    std::shared_ptr<UView *const> view_;
    QPointer<QTextDocument> text_;
    int revision_;
};

void sayNoRoom()
{
    AppMessageBox(Xlate("The margins leave no room for text on the paper. Choose smaller margins under Page Setup."));
}

PrintOutcome printText(UReportView &view, QPrinter &printer, PrintInfo &info, int lastPage)
{
    const PrintedText text(view);
    info.printer = &printer;
    kareport::PrintSource source;
    source.expectedPages = info.maxPage;
    source.begin = [&](QPainter &painter) { view.OnBeginPrinting(painter, info); };
    source.end = [&](QPainter &painter) {
        if (text.isOpen()) {
            view.OnEndPrinting(painter, info);
        }
    };
    const auto isKnown = [&view](int page) { return view.GetPageStarts().size() >= static_cast<std::size_t>(page); };
    source.find = [&, isKnown](QPainter &painter, int page) {
        info.curPage = page;
        view.OnPrepareDC(painter, info);
        // A page that is found is printed, also after the last that was counted: long lines take several rows.
        return isKnown(page) && !view.GetEdit().document()->isEmpty();
    };
    source.print = [&, isKnown](QPainter &painter, int page) {
        info.curPage = page;
        view.OnPrint(painter, info);
        return isKnown(page + 1);
    };
    source.isUnchanged = [&text] { return text.isUnchanged(); };
    return kareport::printPages(printer, source, view.GetWidget(), lastPage);
}

void sayOutcome(const PrintOutcome &outcome, const QString &printer)
{
    switch (outcome.result) {
    case PrintResult::Done:
    case PrintResult::Cancelled: break;
    case PrintResult::Empty: AppMessageBox(Xlate("There is nothing to print on the chosen pages.")); break;
    case PrintResult::Changed:
        AppMessageBox(Xlate("The report has changed while it was printed, and nothing of it was sent to the printer. "
                            "Print it again."));
        break;
    case PrintResult::Failed:
        AppMessageBox(Xlate("The report could not be printed on \"%1\". Check the printer, or choose another one, and "
                            "print again. Nothing of the report is lost.")
                          .arg(printer) +
                      (outcome.reason.isEmpty() ? QString() : QStringLiteral("\n\n") + outcome.reason));
        break;
    }
}

QString nameOf(const QPrinter &printer)
{
    return printer.outputFileName().isEmpty() ? printer.printerName() : printer.outputFileName();
}

} // namespace

/// Matches the page model with the printer.
/// @return whether the page has room for text. Also where there is no printer: preparing the job says so
bool UReportView::measureRoom()
{
    UReportDoc &report = *GetDocument();
    const auto page = [&report] {
        return std::tuple(report.GetPageSize(), report.GetLinesPerPage(), report.GetCharsPerRow());
    };
    const auto before = page();
    const int isMeasured = report.SetPageSize();
    if (page() != before) {
        showMeasuredPage();
    }
    if (isMeasured == 0) {
        return true;
    }
    const QSize sheet = kareport::twipsOfDots(report.GetPageSize(), report.GetPrintResolution());
    return kareport::leavesRoom(sheet, kareport::twipsOfHundredths(report.GetMargins()));
}

void UReportView::OnReportPrint(bool direct)
{
    // Where the user is asked, another sheet may be chosen.
    if (GetDocument() != nullptr && !measureRoom() && direct) {
        sayNoRoom();
        return;
    }
    const auto orientation = kareport::reportOrientation();
    PrintInfo info;
    info.direct = direct;
    print(info);
}

void UReportView::OnPrintSelection()
{
    const QTextCursor cursor = GetEdit().textCursor();
    if (GetDocument() == nullptr || !cursor.hasSelection()) {
        return;
    }
    measureRoom(); // another sheet may be chosen
    const auto orientation = kareport::reportOrientation();
    const QTextDocument &text = *GetEdit().document();
    const QTextBlock last = text.findBlock(cursor.selectionEnd());
    PrintInfo info;
    info.first = text.findBlock(cursor.selectionStart()).position();
    info.last = cursor.selectionEnd() > last.position() ? last.position() + last.length() : last.position();
    print(info);
}

void UReportView::print(PrintInfo &info)
{
    if (OnPreparePrinting(info)) {
        const QString name = nameOf(*info.printer);
        const PrintedText text(*this);
        const PrintOutcome outcome = printText(*this, *info.printer, info, 0);
        if (text.isOpen()) {
            run_.reset(); // the printer is destroyed, even if the job could not begin on it
        }
        sayOutcome(outcome, name);
    }
}

void UReportView::OnReportPrintPreview()
{
    if (GetDocument() != nullptr && !measureRoom()) {
        sayNoRoom();
        return;
    }
    const auto orientation = kareport::reportOrientation();
    PrintInfo info;
    info.preview = true;
    if (!OnPreparePrinting(info)) {
        return;
    }
    bool isCutSaid = false;
    const PrintedText text(*this);
    const QSize preparedSheet = kareport::sheetInTwips(*info.printer);
    const QSize preparedPaper = m_sizePaper;
    kareport::showPreview(*info.printer, GetWidget(), [&](QPrinter &printer) {
        if (!text.isOpen()) {
            return;
        }
        const QSize sheet = kareport::sheetInTwips(printer);
        m_sizePaper = sheet == preparedSheet ? preparedPaper : sheet; // turned or changed in the preview
        const bool prints = printer.paintEngine()->type() != QPaintEngine::Picture;
        if (prints && !kareport::leavesRoom(m_sizePaper, m_rectMargin)) {
            sayNoRoom();
            return;
        }
        PrintInfo shown = info;
        const PrintOutcome outcome = printText(*this, printer, shown, prints ? 0 : mostPreviewPages);
        if (prints) {
            sayOutcome(outcome, nameOf(printer));
        } else if (outcome.isCut && !std::exchange(isCutSaid, true)) {
            AppMessageBox(Xlate("The preview shows the first %1 pages. All pages are printed.").arg(mostPreviewPages));
        }
    });
    if (text.isOpen()) {
        run_.reset(); // the printer is destroyed
    }
}

bool UReportView::OnPreparePrinting(PrintInfo &info)
{
    run_.reset(); // a job that could not begin has left its own, made for a printer that may no longer exist
    const UReportDoc *report = GetDocument();
    if (report == nullptr) {
        return false;
    }
    GetEdit().finishLoading();
    m_sizePaper = kareport::twipsOfDots(report->GetPageSize(), report->GetPrintResolution());
    info.maxPage = kareport::expectedPages(report->GetLineCount(), report->GetLinesPerPage());
    m_rectMargin = kareport::twipsOfHundredths(report->GetMargins());
    if (info.printer == nullptr) {
        if (!kareport::hasReportPrinter()) {
            AppMessageBox(QStringLiteral("No Default Printer is Installed!!!"));
            return false;
        }
        info.ownPrinter =
            kareport::makeReportPrinter(UPreviewDlg::IsModulePrinterOrientationPortrait(), report->GetTitle());
        info.printer = info.ownPrinter.get();
        if (info.printer == nullptr) {
            return false;
        }
    }
    if (info.last >= 0) {
        const QTextDocument &printed = *GetEdit().document();
        const int lines = printed.findBlock(static_cast<int>(info.last) - 1).blockNumber() -
                          printed.findBlock(static_cast<int>(info.first)).blockNumber() + 1;
        info.maxPage = kareport::expectedPages(lines, report->GetLinesPerPage());
    } else if (report->IsPageFixed()) {
        prepareRun(info.printer);
        info.maxPage = printsGivenPages() ? static_cast<int>(run_->sheets.size()) : info.maxPage;
    }
    if (info.preview) {
        return true;
    }
    const PrintedText text(*this);
    const QSize sheet = kareport::sheetInTwips(*info.printer);
    if (!info.direct) {
        const bool isWanted = kareport::askPrint(*info.printer, info.maxPage, GetWidget());
        if (!text.isOpen()) {
            return false;
        }
        if (!isWanted) {
            run_.reset(); // the printer is destroyed
            return false;
        }
    }
    info.printer->setFullPage(true);
    if (kareport::sheetInTwips(*info.printer) != sheet) {
        m_sizePaper = kareport::sheetInTwips(*info.printer); // another one was chosen for this job
    }
    if (!kareport::leavesRoom(m_sizePaper, m_rectMargin)) {
        run_.reset();
        sayNoRoom();
        return false;
    }
    return true;
}
