#include "CsvReader.h"

#include "ProcessorTime.h"

#include <benchmark/benchmark.h>

#include <string>

namespace
{

/// Rows of six cells; compare the bytes a second at N and 10 N.
void readCsv(benchmark::State &state)
{
    std::string text = "number,northing,easting,elevation,station,name\n";
    for (qint64 i = 0; i < state.range(0); ++i) {
        text += std::to_string(i) + ",6295.3311,16603.3967,108.584,12.345,P75954\n";
    }
    const ProcessorTime time;
    for (auto _ : state) {
        kareport::CsvReader reader(QStringLiteral("bench.csv"), text, ',');
        qint64 rows = 0;
        while (reader.next()) {
            ++rows;
        }
        if (rows != state.range(0) + 1) {
            state.SkipWithError("rows were lost");
        }
    }
    state.SetBytesProcessed(state.iterations() * qint64(text.size()));
    time.report(state, static_cast<double>(qint64(text.size())));
}
BENCHMARK(readCsv)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

} // namespace
