#include "UReportView.h"

#include "AppMessageBox.h"
#include "MarginPicture.h"
#include "Preferences.h"
#include "PrintDialogs.h"
#include "PrintGeometry.h"
#include "PrintJob.h"
#include "PrintRun.h"
#include "ReportEdit.h"
#include "ReportOrientation.h"
#include "ReportPrinter.h"
#include "ReportViewWidget.h"
#include "UPreviewDlg.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QPaintEngine>
#include <QPainter>
#include <QPrinter>
#include <QTextBlock>
#include <QTextDocument>

#include <memory>
#include <stdexcept>
#include <utility>

namespace
{

using kareport::PrintInfo;
using kareport::PrintOutcome;
using kareport::PrintResult;

/// A preview keeps its pages in memory.
constexpr int mostPreviewPages = 2000;

/// The text of a view as a job begins with it. View, control and text may go while a window is open.
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
    /// Whether the view is still there. Its widget is no sign of that: it may outlive the view.
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

/// Matches the page model with the printer.
/// @return whether the page has room for text. Also where there is no printer: preparing the job says so
bool measureRoom(UReportDoc &report)
{
    if (report.SetPageSize() == 0) {
        return true;
    }
    const QSize sheet = kareport::twipsOfDots(report.GetPageSize(), report.GetPrintResolution());
    return kareport::leavesRoom(sheet, kareport::twipsOfHundredths(report.GetMargins()));
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
        // A page that is found is printed, also behind the last that was counted: long lines take several rows.
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

void UReportView::OnReportPrint(bool direct)
{
    // Where the user is asked, another sheet may be chosen.
    if (GetDocument() != nullptr && !measureRoom(*GetDocument()) && direct) {
        sayNoRoom();
        return;
    }
    const auto orientation = kareport::reportOrientation();
    PrintInfo info;
    info.direct = direct;
    if (OnPreparePrinting(info)) {
        const QString name = nameOf(*info.printer);
        const PrintedText text(*this);
        const PrintOutcome outcome = printText(*this, *info.printer, info, 0);
        if (text.isOpen()) {
            run_.reset(); // the printer goes, also where the job could not begin on it
        }
        sayOutcome(outcome, name);
    }
}

void UReportView::OnReportPrintPreview()
{
    if (GetDocument() != nullptr && !measureRoom(*GetDocument())) {
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
        run_.reset(); // the printer goes
    }
}

bool UReportView::OnPreparePrinting(PrintInfo &info)
{
    run_.reset(); // a job that could not begin has left its own, made for a printer that may have gone
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
    if (report->IsPageFixed()) {
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
            run_.reset(); // the printer goes
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

void UReportView::OnBeginPrinting(QPainter &painter, PrintInfo &info)
{
    m_aPageStart.assign(1, 0);
    prepareRun(painter.device());
    if (!printsGivenPages()) {
        return;
    }
    m_aPageStart.clear();
    for (const kareport::PrintSheet &sheet : run_->sheets) {
        m_aPageStart.push_back(sheet.start);
    }
    info.maxPage = static_cast<int>(m_aPageStart.size());
}

void UReportView::OnEndPrinting(QPainter & /*painter*/, PrintInfo & /*info*/)
{
    m_aPageStart.clear();
    run_.reset();
}

void UReportView::OnPrepareDC(QPainter &painter, PrintInfo &info)
{
    // A page may be asked for before the pages in front of it have been printed.
    while (!m_aPageStart.empty() && static_cast<qint64>(m_aPageStart.size()) < info.curPage) {
        qint64 length = 0;
        const qint64 next = withPager(*painter.device(), [&](kareport::LinePager &pager) {
            length = pager.length();
            return printsGivenPages() ? length : pager.layOut(printableRect(), m_aPageStart.back(), -1);
        });
        if (next >= length || next <= m_aPageStart.back()) {
            info.maxPage = static_cast<int>(m_aPageStart.size());
            return;
        }
        m_aPageStart.push_back(next);
    }
}

void UReportView::OnPrint(QPainter &painter, PrintInfo &info)
{
    const auto pages = static_cast<qint64>(m_aPageStart.size());
    if (info.curPage < 1 || info.curPage > pages) {
        throw std::invalid_argument("the start of the page is not known");
    }
    const auto index = static_cast<std::size_t>(info.curPage) - 1;
    if (printsGivenPages()) {
        const kareport::PrintSheet sheet = run_->sheets.at(index);
        withPager(*painter.device(), [&](kareport::LinePager &pager) {
            return pager.layOutScaled(printableRect(), sheet.start, sheet.stop, sheet.scale, &painter);
        });
        info.maxPage = static_cast<int>(pages);
        return;
    }
    const qint64 start = m_aPageStart[index];
    const qint64 next = PrintPage(painter, start, -1);
    if (next >= GetEdit().document()->characterCount() - 1) {
        info.maxPage = info.curPage;
    } else if (info.curPage == pages && next > start) {
        m_aPageStart.push_back(next); // a page that takes nothing would be followed by others for ever
    }
}

qint64 UReportView::PrintPage(QPainter &painter, qint64 start, qint64 stop)
{
    if (painter.device() == nullptr) {
        return start;
    }
    return withPager(*painter.device(),
                     [&](kareport::LinePager &pager) { return pager.layOut(printableRect(), start, stop, &painter); });
}

void UReportView::DrawMargins(QPainter &painter)
{
    kareport::drawMargins(painter, printableRect());
}

QRect UReportView::printableRect() const
{
    return kareport::printableRect(m_sizePaper, m_rectMargin);
}

void UReportView::prepareRun(QPaintDevice *device)
{
    QTextDocument &text = *GetEdit().document();
    if (device != nullptr && run_ != nullptr && run_->isFor(text, *device) && run_->room == printableRect()) {
        return; // as it was prepared for
    }
    run_.reset();
    if (device != nullptr) {
        run_ = std::make_unique<kareport::PrintRun>(text, *device);
        run_->room = printableRect();
        run_->pager.setUsualLines(GetDocument() == nullptr ? 0 : GetDocument()->GetLinesPerPage());
        run_->sheets = givenSheets(run_->pager);
    }
}

std::vector<kareport::PrintSheet> UReportView::givenSheets(kareport::LinePager &pager) const
{
    const UReportDoc *report = GetDocument();
    if (report == nullptr || !report->IsPageFixed()) {
        return {};
    }
    // The pages of what is shown: formats and line ends make the places of characters differ from those in the report.
    const QString shown = pager.text().toPlainText();
    std::vector<qint64> starts;
    for (const int line : pageStartLines()) {
        starts.push_back(pager.text().findBlockByNumber(line).position());
    }
    const int lines = report->GetLinesPerPage();
    return kareport::printSheets(pager, printableRect(), kareport::reportPages(QStringView(shown), starts, lines),
                                 lines);
}

bool UReportView::printsGivenPages() const
{
    return run_ != nullptr && !run_->sheets.empty();
}

template <typename Work>
qint64 UReportView::withPager(QPaintDevice &device, Work work) const
{
    QTextDocument &text = *GetEdit().document();
    if (run_ != nullptr && run_->isFor(text, device)) {
        return work(run_->pager);
    }
    kareport::LinePager pager(text, device);
    pager.setUsualLines(GetDocument() == nullptr ? 0 : GetDocument()->GetLinesPerPage());
    return work(pager);
}

void UReportView::OnPageSetup()
{
    UReportDoc *report = GetDocument();
    if (report == nullptr) {
        return;
    }
    const auto orientation = kareport::reportOrientation();
    if (!kareport::hasReportPrinter()) {
        AppMessageBox(Xlate("Failed to get default printer settings."));
        return;
    }
    kareport::PageSetup setup;
    setup.margins = report->GetMargins();
    setup.portrait = UPreviewDlg::IsModulePrinterOrientationPortrait();
    setup.asksForPages = true;
    setup.givenLines = report->GetGivenLinesPerPage();
    setup.keepsGivenPages = report->IsPageFixed();
    kareport::fillPrinters(setup);
    const PrintedText text(*this);
    if (!kareport::askPageSetup(setup, GetWidget()) || !text.isOpen()) {
        return;
    }
    UPreviewDlg::SetModulePrinterOrientationPortrait(setup.portrait);
    kareport::selectPrinter(setup.printer, setup.sheet);
    report->SetMargins(setup.margins);
    report->UseGivenPage(setup.keepsGivenPages);
    report->SetPageSize();
    report->SaveSettings();
    for (UView *view : report->GetViews()) {
        const auto *shown = dynamic_cast<UReportView *>(view);
        if (shown != nullptr && shown->widget_) {
            static_cast<kareport::ReportViewWidget *>(shown->widget_.data())->showPlace();
        }
    }
    // After the measurement, which the next print command repeats: the report that is open keeps its pages till then.
    SetReportPrinterSetToPortrait(UPreviewDlg::IsModulePrinterOrientationPortrait());
}
