#include "FieldFormatter.h"
#include "FixedNotation.h"
#include "VariableType.h"
#include "WideVectors.h"

#include <benchmark/benchmark.h>

#include <cstdio>

namespace
{

double nextValue(double value)
{
    return value < 1e6 ? value + 123.4567 : 0.1234;
}

void fixedNotation(benchmark::State &state)
{
    double value = 0;
    for (auto _ : state) {
        value = nextValue(value);
        benchmark::DoNotOptimize(kareport::FixedNotation(value, 3).digits().size());
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(fixedNotation);

void printfForComparison(benchmark::State &state)
{
    double value = 0;
    char text[64];
    for (auto _ : state) {
        value = nextValue(value);
        benchmark::DoNotOptimize(std::snprintf(text, sizeof text, "%.3f", value));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(printfForComparison);

void formatField(benchmark::State &state)
{
    sXmlReportField field;
    field.Width = 14;
    field.Decimals = 3;
    field.Align = QStringLiteral("R");
    field.Type = static_cast<qint32>(state.range(0));
    const kareport::FieldFormatter formatter(field);
    const UJobSettings settings;
    const kareport::FormatOptions options{&settings, u' ', false, false};
    kareport::TextBuffer out;
    double value = 0;
    for (auto _ : state) {
        kareport::endWideVectors(); // as before each row
        out.clear();
        value = nextValue(value);
        formatter.append(out, options, kareport::ValueKind::Double, &value, QStringView());
        benchmark::DoNotOptimize(out.view().utf16());
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(formatField)->Arg(VARIABLE_COORDINATE)->Arg(VARIABLE_STATION)->Arg(VARIABLE_OFFSET)->Arg(VARIABLE_BEARING);

} // namespace
