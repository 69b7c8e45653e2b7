#include "Pages.h"

#include "PageFit.h"
#include "PdfExport.h"
#include "PrintGeometry.h"
#include "ReportContent.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "World.h"

#include <QBuffer>
#include <QCryptographicHash>
#include <QDataStream>
#include <QFile>
#include <QPageSize>
#include <QPainter>
#include <QPrinter>
#include <QProcess>
#include <QTextDocument>

#include <algorithm>

namespace monkey
{

namespace
{

constexpr double pointsPerInch = 72;
constexpr int mostSheets = 2000;

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

} // namespace

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

std::vector<Page> pagesFor(const UReportDoc &report)
{
    const QString text = report.HoldsRichTextSource() ? kareport::shownPlainText(report) : report.CopyText();
    const QSizeF room = roomOf(report);
    std::vector<Page> pages;
    for (const kareport::ReportPage &page : report.GetPages()) {
        const QString piece = text.mid(page.begin, page.end - page.begin);
        pages.push_back({inkOf(piece), hasRoomFor(piece, room)});
    }
    return pages;
}

namespace
{

/// Where two texts part, for whoever reads the log.
QString partingOf(const QString &one, const QString &other)
{
    constexpr int shown = 60;
    const auto at = std::mismatch(one.begin(), one.end(), other.begin(), other.end()).first - one.begin();
    return QStringLiteral("of %1 and %2 characters, from %3: '%4', '%5'")
        .arg(one.size())
        .arg(other.size())
        .arg(at)
        .arg(one.mid(at, shown), other.mid(at, shown));
}

/// Holds sheets against pages: each page begins a sheet and has all its characters, and takes further sheets only where it
/// has no room on one.
/// @return where they part; empty where they do not
QString difference(const QStringList &sheets, const std::vector<Page> &pages)
{
    qsizetype sheet = 0;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        const qsizetype first = sheet;
        QString printed = sheet < sheets.size() ? inkOf(sheets[sheet]) : QStringLiteral("(no sheet)");
        ++sheet;
        while (!pages[i].hasRoom && printed.size() < pages[i].ink.size() && sheet < sheets.size()) {
            printed += inkOf(sheets[sheet]);
            ++sheet;
        }
        if (printed != pages[i].ink) {
            return QStringLiteral("sheet %1 of %2 is not page %3 of %4, ")
                       .arg(first + 1)
                       .arg(sheets.size())
                       .arg(i + 1)
                       .arg(pages.size()) +
                   partingOf(printed, pages[i].ink);
        }
    }
    return sheet == sheets.size() ? QString()
                                  : QStringLiteral("%1 pages have %2 sheets").arg(pages.size()).arg(sheets.size());
}

/// The text of each sheet of a PDF, as another program reads it.
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

QByteArray World::printOf(UReportView &view) const
{
    const UReportDoc &report = *view.GetDocument();
    const QString path = folder_.filePath(QStringLiteral("printed.pdf"));
    QPrinter printer;
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setOutputFileName(path);
    printer.setFullPage(true);
    printer.setPageSize(QPageSize(QSizeF(report.GetPageSize()) / report.GetPrintResolution(), QPageSize::Inch,
                                  QString(), QPageSize::ExactMatch));
    kareport::PrintInfo info;
    info.printer = &printer;
    info.preview = true; // nothing is asked
    if (!view.OnPreparePrinting(info)) {
        return {};
    }
    {
        QPainter painter(&printer);
        view.OnBeginPrinting(painter, info);
        for (info.curPage = 1; info.curPage <= mostSheets; ++info.curPage) {
            // A page that is found is printed, also after the last that was counted, as where lines take several rows.
            view.OnPrepareDC(painter, info);
            if (view.GetPageStarts().size() < static_cast<std::size_t>(info.curPage)) {
                break;
            }
            if (info.curPage > 1) {
                printer.newPage();
            }
            view.OnPrint(painter, info);
        }
        view.OnEndPrinting(painter, info);
    }
    QFile file(path);
    const QByteArray pdf = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    file.remove();
    return pdf;
}

QString World::checkPrint(UReportView &view) const
{
    const UReportDoc &report = *view.GetDocument();
    const QSizeF room = roomOf(report);
    if (report.GetPrintResolution() == 0 || room.width() <= 0 || room.height() <= 0) {
        return {}; // the margins leave no room, which a message says
    }
    const qint64 limit = fileLimit();
    limitFiles(-1);
    const QByteArray pdf = printOf(view);
    limitFiles(limit);
    if (pdf.isEmpty()) {
        return QStringLiteral("cannot be printed");
    }
    const QStringList sheets = sheetsOf(pdf);
    if (report.IsPageFixed() && !isRich(report)) {
        return difference(sheets, pagesFor(report));
    }
    // Its lines flow from sheet to sheet.
    const QString printed = inkOf(sheets.join(QString()));
    const QString shown = inkOf(view.GetEdit().document()->toPlainText());
    return printed == shown ? QString() : QStringLiteral("the sheets have another text, ") + partingOf(printed, shown);
}

QByteArray World::makingOf(const UReportDoc &report)
{
    QByteArray making;
    QDataStream stream(&making, QIODevice::WriteOnly);
    const QString text = report.CopyText();
    QCryptographicHash hash(QCryptographicHash::Sha1);
    hash.addData(QByteArrayView(reinterpret_cast<const char *>(text.utf16()), text.size() * 2));
    stream << hash.result() << report.GetPageSize() << report.GetPrintResolution() << report.GetMargins()
           << report.IsPageFixed() << report.GetLinesPerPage() << report.GetCharsPerRow() << report.GetFontName()
           << report.GetFontSize() << report.HasLostText() << report.IsOpenedFromRtf() << report.GetRTFDataFlag()
           << report.GetLineCount();
    for (const qint64 start : report.GetPageStarts()) {
        stream << start;
    }
    return making;
}

bool World::isNew(const QByteArray &making)
{
    const std::size_t before = lookedAt_.size();
    lookedAt_.insert(making);
    return lookedAt_.size() > before;
}

QString World::checkPages()
{
    // What takes its time, or changes what happens: printing ends a load in pieces.
    constexpr quint64 interval = 56; // steps
    const bool isTurn = steps_ % interval == 0;
    const auto isLookedAt = [isTurn](const UReportDoc &report) {
        constexpr qint64 longText = 2'000'000;
        return !report.IsEmpty() && (report.GetTextLength() < longText || isTurn);
    };
    for (const UReportDoc *report : reports()) {
        if (isLookedAt(*report) && isNew("PDF" + makingOf(*report))) {
            if (const QString wrong = checkPdf(*report); !wrong.isEmpty()) {
                return QStringLiteral("the PDF of \"%1\": ").arg(report->GetTitle()) + wrong;
            }
        }
    }
    for (UReportView *view : viewsOnScreen()) {
        const UReportDoc &report = *view->GetDocument();
        // Formats are the view's own.
        const bool hasFormats = view->ShowsFormats() || isRich(report);
        const QByteArray formats = hasFormats ? view->GetEdit().document()->toHtml().toUtf8() : QByteArray();
        const bool isWhole = !view->GetEdit().isLoading() || isTurn;
        if (isWhole && isLookedAt(report) && isNew("print" + makingOf(report) + formats)) {
            if (const QString wrong = checkPrint(*view); !wrong.isEmpty()) {
                return QStringLiteral("\"%1\" printed: ").arg(report.GetTitle()) + wrong;
            }
        }
    }
    return {};
}

} // namespace monkey
