#include "World.h"

#include "PrintGeometry.h"
#include "ReportPrinter.h"
#include "UReportDoc.h"
#include "UReportView.h"

#include <QBuffer>
#include <QImage>
#include <QPainter>

#include <algorithm>

namespace monkey
{

namespace
{

/// Whether each page has its sheet: one with very many lines goes on on further ones.
bool hasUsualPages(const UReportDoc &report)
{
    constexpr qint64 mostLines = 60; // which the smallest type has room for on any sheet
    const std::vector<kareport::ReportPage> pages = report.GetPages();
    return std::all_of(pages.begin(), pages.end(),
                       [](const kareport::ReportPage &page) { return page.lines <= mostLines; });
}

} // namespace

QString World::checkPdf(const UReportDoc &report)
{
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    if (!report.WritePdf(pdf)) {
        return {}; // margins without room are told by their own message
    }
    const qsizetype sheets = pdf.data().count("/Type /Page\n");
    const qsizetype pages = pagesOf(report);
    return sheets < pages || (sheets > pages && hasUsualPages(report))
               ? QStringLiteral("the PDF of \"%1\" has %2 pages, the report %3")
                     .arg(report.GetTitle())
                     .arg(sheets)
                     .arg(pages)
               : QString();
}

QString World::checkPrint(UReportView &view)
{
    const UReportDoc &report = *view.GetDocument();
    kareport::PrintInfo info;
    info.preview = true;
    if (!report.IsPageFixed() || !kareport::hasReportPrinter() || !view.OnPreparePrinting(info)) {
        return {};
    }
    QImage sheet(10, 10, QImage::Format_RGB32);
    QPainter painter(&sheet);
    view.OnEndPrinting(painter, info);
    const qsizetype pages = pagesOf(report);
    return info.maxPage < pages || (info.maxPage > pages && hasUsualPages(report))
               ? QStringLiteral("\"%1\" is printed on %2 sheets, and has %3 pages")
                     .arg(report.GetTitle())
                     .arg(info.maxPage)
                     .arg(pages)
               : QString();
}

QString World::checkPages()
{
    constexpr int interval = 7; // steps: a PDF takes its time
    if (steps_ % interval != 0) {
        return {};
    }
    for (const UReportDoc *report : reports()) {
        if (!isRich(*report) && !report->IsEmpty()) {
            if (const QString wrong = checkPdf(*report); !wrong.isEmpty()) {
                return wrong;
            }
        }
    }
    for (UReportView *view : viewsOnScreen()) {
        if (!isRich(*view->GetDocument()) && !view->GetDocument()->IsEmpty()) {
            if (const QString wrong = checkPrint(*view); !wrong.isEmpty()) {
                return wrong;
            }
        }
    }
    return {};
}

} // namespace monkey
