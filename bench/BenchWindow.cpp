#include "ReportEntry.h"
#include "ReportInitialTemplate.h"
#include "ReportWindowEntry.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UXTPMDIFrameWnd.h"

#include <QCoreApplication>
#include <QElapsedTimer>

#include <benchmark/benchmark.h>

#include <algorithm>

namespace
{

/// Writes lines into a report while the windows are served every 20 ms, as a job does.
/// @return the longest time that they were not served, or took to be served, in milliseconds
double writeLines(UReportDoc &report, int count)
{
    constexpr qint64 served = 20'000'000; // nanoseconds
    const QString line = QStringLiteral("C1234  | 12+345.678|   0.000|  +0.000|  -4120.319|  -18436.903|  57.461");
    QElapsedTimer since;
    since.start();
    double longest = 0;
    for (int i = 0; i < count; ++i) {
        report.WriteLine(line, 0, 1, 0);
        if (since.nsecsElapsed() > served) {
            since.start();
            QCoreApplication::processEvents();
            longest = std::max(longest, double(since.nsecsElapsed()) / 1e6);
            since.start();
        }
    }
    since.start();
    QCoreApplication::processEvents();
    return std::max(longest, double(since.nsecsElapsed()) / 1e6);
}

void writeReport(benchmark::State &state, bool inWindow)
{
    UApplication application;
    application.AddDocTemplate(ReportInitialTemplate());
    UXTPMDIFrameWnd frame;
    frame.resize(1000, 760);
    frame.show();
    double longest = 0;
    for (auto _ : state) {
        UReportDoc *report = inWindow ? CreateReportWindow(QStringLiteral("R"), true, false)
                                      : CreateReport(QStringLiteral("R"), true, false, nullptr, 0, nullptr);
        QCoreApplication::processEvents();
        longest = std::max(longest, writeLines(*report, static_cast<int>(state.range(0))));
        state.PauseTiming();
        report->OnCloseDocument();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        state.ResumeTiming();
    }
    state.counters["longest_ms"] = longest;
}

void writeWithoutWindow(benchmark::State &state)
{
    writeReport(state, false);
}

void writeIntoWindow(benchmark::State &state)
{
    writeReport(state, true);
}

} // namespace

BENCHMARK(writeWithoutWindow)->Arg(300'000)->Unit(benchmark::kMillisecond);
BENCHMARK(writeIntoWindow)->Arg(30'000)->Arg(300'000)->Arg(3'000'000)->Unit(benchmark::kMillisecond);
