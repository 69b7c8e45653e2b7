#include "DefaultPrinter.h"
#include "UReportDoc.h"

#include "ProcessorTime.h"

#include <benchmark/benchmark.h>

namespace
{

/// Lines of 80 characters; compare the rates at N and 10 N.
void writeLines(benchmark::State &state)
{
    const QString line(80, u'x');
    const ProcessorTime time;
    for (auto _ : state) {
        UReportDoc report;
        report.SetHeaderFlag(true);
        for (qint64 i = 0; i < state.range(0); ++i) {
            report.WriteLine(line, 0, 1, 0);
        }
        benchmark::DoNotOptimize(report.GetLineCount());
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    time.report(state, static_cast<double>(state.range(0)));
}
BENCHMARK(writeLines)->Arg(100'000)->Arg(1'000'000)->Arg(10'000'000)->Unit(benchmark::kMillisecond);

} // namespace
