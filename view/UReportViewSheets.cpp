#include "UReportView.h"

#include "MarginPicture.h"
#include "PrintGeometry.h"
#include "PrintRun.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "ReportViewWidget.h"
#include "UReportDoc.h"

#include <QPainter>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <memory>
#include <stdexcept>

using kareport::PrintInfo;

void UReportView::OnBeginPrinting(QPainter &painter, PrintInfo &info)
{
    m_aPageStart.assign(1, info.first);
    prepareRun(painter.device());
    if (!printsSheets(info)) {
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
        const qint64 length = endOf(info);
        const qint64 next =
            printsSheets(info) ? length : layOutFrom(m_aPageStart.back(), info, *painter.device(), nullptr);
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
    if (printsSheets(info)) {
        const kareport::PrintSheet sheet = run_->sheets.at(index);
        withPager(*painter.device(), [&](kareport::LinePager &pager) {
            return pager.layOutScaled(printableRect(), sheet.start, sheet.stop, sheet.scale, &painter);
        });
        info.maxPage = static_cast<int>(pages);
        return;
    }
    const qint64 start = m_aPageStart[index];
    const qint64 next = layOutFrom(start, info, *painter.device(), &painter);
    if (next >= endOf(info)) {
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
    const auto pages = FindGivenPages();
    return pages ? kareport::printSheets(pager, printableRect(), *pages, GetDocument()->GetLinesPerPage())
                 : std::vector<kareport::PrintSheet>();
}

std::optional<std::vector<kareport::ReportPage>> UReportView::FindGivenPages() const
{
    const UReportDoc *report = GetDocument();
    if (report == nullptr || !report->IsPageFixed() || !widget_) {
        return std::nullopt;
    }
    const auto &widget = *static_cast<const kareport::ReportViewWidget *>(widget_.data());
    if (!showsFormats_) {
        return widget.reportPages();
    }
    // The pages of what is shown: formats and line ends make the places of characters differ from those in the report. A line
    // that is broken within a paragraph counts as two.
    const QTextDocument &document = *GetEdit().document();
    const QString shown = document.toPlainText();
    std::vector<qint64> starts;
    for (const int line : pageStartLines()) {
        starts.push_back(document.findBlockByNumber(line).position());
    }
    return kareport::reportPages(QStringView(shown), starts, report->GetLinesPerPage());
}

bool UReportView::printsGivenPages() const
{
    return run_ != nullptr && !run_->sheets.empty();
}

bool UReportView::printsSheets(const PrintInfo &info) const
{
    return printsGivenPages() && info.last < 0;
}

qint64 UReportView::endOf(const PrintInfo &info) const
{
    const qint64 length = GetEdit().document()->characterCount() - 1;
    return info.last < 0 ? length : std::min(info.last, length);
}

qint64 UReportView::layOutFrom(qint64 start, const PrintInfo &info, QPaintDevice &device, QPainter *painter) const
{
    return withPager(device, [&](kareport::LinePager &pager) {
        // A part of pages that have sheets of their own has the type of these.
        return printsGivenPages() ? pager.layOutScaled(printableRect(), start, info.last, usualScale(), painter)
                                  : pager.layOut(printableRect(), start, info.last, painter);
    });
}

qreal UReportView::usualScale() const
{
    qreal scale = 0;
    for (const kareport::PrintSheet &sheet : run_->sheets) {
        scale = std::max(scale, sheet.scale);
    }
    return scale;
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
