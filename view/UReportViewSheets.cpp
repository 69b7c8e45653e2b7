#include "UReportView.h"

#include "MarginPicture.h"
#include "PrintGeometry.h"
#include "PrintRun.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "UReportDoc.h"

#include <QPainter>
#include <QTextBlock>
#include <QTextDocument>

#include <memory>
#include <stdexcept>

using kareport::PrintInfo;

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
        m_aPageStart.push_back(next); // a page that takes nothing would be followed by others without end
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
