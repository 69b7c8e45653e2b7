#include "CompressedFaces.h"
#include "PdfExport.h"
#include "ProcessorTime.h"
#include "UReportDoc.h"

#include <QBuffer>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace
{

/// A row of a point list, 80 characters long.
QString pointRow(qint64 number)
{
    return QStringLiteral("P%1|%2|%3|%4|%5|%6|")
        .arg(number, -9)
        .arg(double(number) * 0.05, 13, 'f', 3)
        .arg(5000 + double(number * 7919 % 4000000) / 1000, 14, 'f', 3)
        .arg(16000 + double(number * 104729 % 4000000) / 1000, 14, 'f', 3)
        .arg(double(number * 31 % 90000) / 1000, 10, 'f', 3)
        .arg(QStringLiteral("iron pipe"), -12)
        .leftJustified(80);
}

void writeRows(UReportDoc &report, qint64 lines)
{
    for (qint64 i = 0; i < lines; ++i) {
        report.WriteLine(pointRow(i), 0, 1, 0);
    }
}

/// Pages of 72 lines; compare the rates at N and 10 N.
void pdfPages(benchmark::State &state)
{
    UReportDoc report;
    report.FixPage(72, 80);
    report.SetPageSize();
    writeRows(report, 72 * state.range(0));
    const ProcessorTime time;
    for (auto _ : state) {
        QBuffer pdf;
        pdf.open(QIODevice::WriteOnly);
        if (!report.WritePdf(pdf)) {
            state.SkipWithError("the PDF could not be written");
        }
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    time.report(state, static_cast<double>(state.range(0)));
}
BENCHMARK(pdfPages)->Arg(100)->Arg(1000)->Arg(10'000)->Unit(benchmark::kMillisecond);

/// A page, in a process that has written such a page before: with the face that was kept of it, or without.
void pdfOfOnePage(benchmark::State &state)
{
    UReportDoc report;
    report.FixPage(72, 80);
    report.SetPageSize();
    writeRows(report, 72);
    const QByteArray others(kareport::CompressedFaces::mostBytes - 1, 'x');
    const bool isKept = state.range(0) != 0;
    for (auto _ : state) {
        if (!isKept) {
            state.PauseTiming();
            kareport::CompressedFaces::ofProcess().keep(others, "x"); // which takes the place of all else
            state.ResumeTiming();
        }
        QBuffer pdf;
        pdf.open(QIODevice::WriteOnly);
        if (!report.WritePdf(pdf)) {
            state.SkipWithError("the PDF could not be written");
        }
    }
}
BENCHMARK(pdfOfOnePage)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);

void saveReportFile(benchmark::State &state)
{
    const QTemporaryDir folder(QStringLiteral("/dev/shm/ka_bench"));
    UReportDoc report;
    writeRows(report, state.range(0));
    for (auto _ : state) {
        benchmark::DoNotOptimize(report.OnSaveDocument(folder.filePath(QStringLiteral("a.rep"))));
    }
    state.SetBytesProcessed(state.iterations() * state.range(0) * 82);
}
BENCHMARK(saveReportFile)->Arg(120'000)->Arg(1'200'000)->Unit(benchmark::kMillisecond);

void loadReportFile(benchmark::State &state)
{
    const QTemporaryDir folder(QStringLiteral("/dev/shm/ka_bench"));
    const QString file = folder.filePath(QStringLiteral("a.rep"));
    {
        UReportDoc report;
        writeRows(report, state.range(0));
        report.OnSaveDocument(file);
    }
    const ProcessorTime time;
    for (auto _ : state) {
        UReportDoc report;
        benchmark::DoNotOptimize(report.LoadFile(file, true));
    }
    state.SetBytesProcessed(state.iterations() * state.range(0) * 83);
    time.report(state, static_cast<double>(state.range(0)));
}
BENCHMARK(loadReportFile)->Arg(120'000)->Arg(1'200'000)->Unit(benchmark::kMillisecond);

/// Writing the lines in rich-text mode and assembling the document.
void richTextImage(benchmark::State &state)
{
    UReportDoc report;
    report.SetRTFDataFlag(true);
    writeRows(report, state.range(0));
    for (auto _ : state) {
        QString document;
        report.GetRTFData(document);
        benchmark::DoNotOptimize(document.size());
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}
BENCHMARK(richTextImage)->Arg(30'000)->Arg(300'000)->Unit(benchmark::kMillisecond);

} // namespace
