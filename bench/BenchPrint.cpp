#include "LinePager.h"
#include "PrintJob.h"
#include "ProcessorTime.h"

#include <QPainter>
#include <QPlainTextDocumentLayout>
#include <QPrinter>
#include <QTemporaryDir>
#include <QTextDocument>

#include <benchmark/benchmark.h>

#include <vector>

namespace
{

/// Rows of a point list, 80 characters long, 72 to a page.
QString pointRows(qint64 pages)
{
    QString text;
    text.reserve(pages * 72 * 81);
    for (qint64 i = 0; i < pages * 72; ++i) {
        text += QStringLiteral("P%1|%2|%3|%4|%5|iron pipe   |")
                    .arg(i, -9)
                    .arg(double(i) * 0.05, 13, 'f', 3)
                    .arg(5000 + double(i * 7919 % 4000000) / 1000, 14, 'f', 3)
                    .arg(16000 + double(i * 104729 % 4000000) / 1000, 14, 'f', 3)
                    .arg(double(i * 31 % 90000) / 1000, 10, 'f', 3)
                    .leftJustified(80) +
                u'\n';
    }
    return text;
}

/// A text on a printer of 600 dots per inch, on sheets that take 72 lines.
struct Printed
{
    explicit Printed(qint64 pages)
    {
        document.setDocumentLayout(new QPlainTextDocumentLayout(&document));
        QFont font;
        font.setFamilies({QStringLiteral("DejaVu Sans Mono")});
        font.setFixedPitch(true);
        font.setPointSize(8);
        document.setDefaultFont(font);
        document.setUndoRedoEnabled(false);
        document.setPlainText(pointRows(pages));
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(folder.filePath(QStringLiteral("pages.pdf")));
        printer.setResolution(600);
        printer.setPageSize(QPageSize(QPageSize::A4));
        printer.setFullPage(true);
    }

    QTemporaryDir folder{QStringLiteral("/dev/shm/ka_bench")};
    QTextDocument document;
    QPrinter printer{QPrinter::HighResolution};
    const QRect page{567, 567, 10659, 13490};
};

/// Where the pages begin, as a preview or a job for some of the pages needs it.
void countPrintPages(benchmark::State &state)
{
    Printed printed(state.range(0));
    qint64 pages = 0;
    for (auto _ : state) {
        kareport::LinePager pager(printed.document, printed.printer);
        for (qint64 next = 0; next < pager.length(); ++pages) {
            next = pager.layOut(printed.page, next, -1);
        }
    }
    state.SetItemsProcessed(pages);
}
BENCHMARK(countPrintPages)->Arg(100)->Arg(1000)->Arg(10'000)->Unit(benchmark::kMillisecond);

/// One page in the middle of a line of that many pages: in the time of a page, not of the line.
void pageOfALongLine(benchmark::State &state)
{
    Printed printed(1);
    printed.document.setPlainText(QStringLiteral("words and words ").repeated(state.range(0) * 450));
    for (auto _ : state) {
        kareport::LinePager pager(printed.document, printed.printer);
        benchmark::DoNotOptimize(pager.layOut(printed.page, pager.length() / 2, -1));
    }
}
BENCHMARK(pageOfALongLine)->Arg(40)->Arg(400)->Unit(benchmark::kMillisecond);

/// Pages of a job into a file, with its progress; compare the rates at N and 10 N, and the memory that a job takes above
/// the open text.
void printPages(benchmark::State &state)
{
    Printed printed(state.range(0));
    const long before = peakMemory();
    int pages = 0;
    for (auto _ : state) {
        kareport::LinePager pager(printed.document, printed.printer);
        std::vector<qint64> starts = {0};
        kareport::PrintSource source;
        source.expectedPages = static_cast<int>(state.range(0));
        source.begin = [](QPainter &) {};
        source.end = [](QPainter &) {};
        source.isUnchanged = [] { return true; };
        source.find = [](QPainter &, int) { return true; };
        source.print = [&](QPainter &painter, int) {
            starts.push_back(pager.layOut(printed.page, starts.back(), -1, &painter));
            return starts.back() < pager.length();
        };
        pages += kareport::printPages(printed.printer, source, nullptr).pages;
    }
    state.SetItemsProcessed(pages);
    state.counters["extra_MB"] = double(peakMemory() - before) / 1024;
}
BENCHMARK(printPages)->Arg(100)->Arg(1000)->Arg(10'000)->Unit(benchmark::kMillisecond);

} // namespace
