#include "World.h"

#include "PageFit.h"
#include "PdfExport.h"
#include "PrintGeometry.h"
#include "ReportContent.h"
#include "ReportPages.h"
#include "UReportDoc.h"
#include "UReportView.h"

#include <QBuffer>
#include <QFile>
#include <QPageSize>
#include <QPainter>
#include <QPrinter>
#include <QProcess>

#include <algorithm>

namespace monkey
{

namespace
{

constexpr double pointsPerInch = 72;

/// What leaves ink, and does in every face: a sheet is compared by it.
QString inkOf(QStringView text)
{
    QString ink;
    for (const QChar character : text) {
        const char16_t code = character.unicode();
        if (code > u' ' && code < u'\x7F' && code != u'?') {
            ink += character;
        }
    }
    return ink;
}

/// The first line of a text that leaves ink.
QString firstInk(const QString &text)
{
    for (const QStringView line : QStringView(text).split(u'\n')) {
        if (const QString ink = inkOf(line); !ink.isEmpty()) {
            return ink;
        }
    }
    return {};
}

/// A page of a report, and whether it has room on a sheet in the smallest type.
struct Page
{
    QString firstInk;
    bool hasRoom = true;
};

/// The part of a sheet that takes text, in points.
QSizeF roomOf(const UReportDoc &report)
{
    const double dots = std::max(1u, report.GetPrintResolution());
    const QMargins margins = report.GetMargins();
    const auto points = [](int hundredths) { return hundredths * pointsPerInch / 2540; };
    return {report.GetPageSize().width() * pointsPerInch / dots - points(margins.left() + margins.right()),
            report.GetPageSize().height() * pointsPerInch / dots - points(margins.top() + margins.bottom())};
}

/// Whether lines have room on a sheet, with something to spare.
bool hasRoomFor(const QString &text, const QSizeF &room)
{
    constexpr double rowHeight = 1.5; // of the type
    constexpr double cellWidth = 0.7;
    const QStringList lines = text.split(u'\n');
    qsizetype widest = 0;
    for (const QString &line : lines) {
        constexpr int mostCells = 8; // of a tab
        const qsizetype wide = std::count_if(line.begin(), line.end(), [](QChar c) { return c < u' ' || c > u'~'; });
        widest = std::max(widest, line.size() + (mostCells - 1) * wide);
    }
    return double(lines.size()) * rowHeight * kareport::smallestType <= room.height() &&
           double(widest) * cellWidth * kareport::smallestType <= room.width();
}

/// The pages that a report says it has.
std::vector<Page> pagesFor(const UReportDoc &report)
{
    const QString text = report.HoldsRichTextSource() ? kareport::shownPlainText(report) : report.CopyText();
    const QSizeF room = roomOf(report);
    std::vector<Page> pages;
    for (const kareport::ReportPage &page : report.GetPages()) {
        const QString piece = text.mid(page.begin, page.end - page.begin);
        pages.push_back({firstInk(piece), hasRoomFor(piece, room)});
    }
    return pages;
}

/// Holds sheets against pages: each page begins a sheet, and takes further ones only where it has no room on it.
/// @return where they part; empty where they do not
QString difference(const QStringList &sheets, const std::vector<Page> &pages)
{
    qsizetype sheet = 0;
    for (std::size_t i = 0; i < pages.size(); ++i, ++sheet) {
        const QString begins = sheet < sheets.size() ? firstInk(sheets[sheet]) : QStringLiteral("(no sheet)");
        const bool isSame = begins == pages[i].firstInk || (!pages[i].hasRoom && pages[i].firstInk.startsWith(begins));
        if (!isSame) {
            return QStringLiteral("sheet %1 of %2 begins with '%3', page %4 of %5 with '%6'")
                .arg(sheet + 1)
                .arg(sheets.size())
                .arg(begins)
                .arg(i + 1)
                .arg(pages.size())
                .arg(pages[i].firstInk);
        }
        const bool isLast = i + 1 == pages.size();
        while (!pages[i].hasRoom && sheet + 1 < sheets.size() &&
               (isLast || firstInk(sheets[sheet + 1]) != pages[i + 1].firstInk))
        {
            ++sheet;
        }
    }
    return sheet == sheets.size() ? QString()
                                  : QStringLiteral("%1 pages have %2 sheets").arg(pages.size()).arg(sheets.size());
}

/// The text of each sheet of a PDF, as somebody else's program reads it.
QStringList sheetsOf(const QByteArray &pdf)
{
    QProcess reader;
    reader.start(QStringLiteral("pdftotext"), {QStringLiteral("-layout"), QStringLiteral("-"), QStringLiteral("-")});
    reader.write(pdf);
    reader.closeWriteChannel();
    reader.waitForFinished(-1);
    QStringList sheets = QString::fromUtf8(reader.readAllStandardOutput()).split(u'\f');
    sheets.removeLast(); // each ends with a form feed
    return sheets;
}

} // namespace

QString World::checkPdf(const UReportDoc &report)
{
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    kareport::PdfNotes notes;
    if (!report.WritePdf(pdf, &notes)) {
        const QSizeF room = roomOf(report);
        const bool isMeasured = report.GetPrintResolution() > 0 && !report.HasLostText();
        return isMeasured && room.width() > 0 && room.height() > 0 ? QStringLiteral("no PDF: ") + notes.problem
                                                                   : QString();
    }
    return difference(sheetsOf(pdf.data()), pagesFor(report));
}

QString World::checkPrint(UReportView &view) const
{
    const UReportDoc &report = *view.GetDocument();
    const QSizeF room = roomOf(report);
    if (!report.IsPageFixed() || report.GetPrintResolution() == 0 || room.width() <= 0 || room.height() <= 0) {
        return {}; // its lines flow, or the margins leave no room, which a message says
    }
    const qint64 limit = fileLimit();
    limitFiles(-1);
    const QString path = folder_.filePath(QStringLiteral("printed.pdf"));
    {
        QPrinter printer;
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(path);
        printer.setFullPage(true);
        printer.setPageSize(QPageSize(QSizeF(report.GetPageSize()) / report.GetPrintResolution(), QPageSize::Inch,
                                      QString(), QPageSize::ExactMatch));
        kareport::PrintInfo info;
        info.printer = &printer;
        info.preview = true; // nobody is asked
        if (!view.OnPreparePrinting(info)) {
            limitFiles(limit);
            return QStringLiteral("cannot be printed");
        }
        QPainter painter(&printer);
        view.OnBeginPrinting(painter, info);
        for (info.curPage = 1; info.curPage <= info.maxPage; ++info.curPage) {
            if (info.curPage > 1) {
                printer.newPage();
            }
            view.OnPrepareDC(painter, info);
            view.OnPrint(painter, info);
        }
        view.OnEndPrinting(painter, info);
    }
    QFile file(path);
    const QByteArray pdf = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    file.remove();
    limitFiles(limit);
    return difference(sheetsOf(pdf), pagesFor(report));
}

QString World::checkPages() const
{
    constexpr int interval = 7; // steps: a PDF takes its time
    if (steps_ % interval != 0) {
        return {};
    }
    const auto isLookedAt = [this](const UReportDoc &report) {
        constexpr qint64 longText = 200'000;
        return !report.IsEmpty() && (report.GetTextLength() < longText || steps_ % (8 * interval) == 0);
    };
    for (const UReportDoc *report : reports()) {
        if (isLookedAt(*report)) {
            if (const QString wrong = checkPdf(*report); !wrong.isEmpty()) {
                return QStringLiteral("the PDF of \"%1\": ").arg(report->GetTitle()) + wrong;
            }
        }
    }
    for (UReportView *view : viewsOnScreen()) {
        if (isLookedAt(*view->GetDocument()) && !isRich(*view->GetDocument())) {
            if (const QString wrong = checkPrint(*view); !wrong.isEmpty()) {
                return QStringLiteral("\"%1\" printed: ").arg(view->GetDocument()->GetTitle()) + wrong;
            }
        }
    }
    return {};
}

} // namespace monkey
