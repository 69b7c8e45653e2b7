#include "CsvObjectList.h"
#include "CsvReader.h"
#include "JsonFileList.h"
#include "VariableType.h"

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

kareport::Variables oneVariable()
{
    const kareport::FindVariable find = [](const QString &name) -> std::optional<kareport::ValueParser> {
        return name == u"Number" ? std::optional(kareport::ValueParser(VARIABLE_NUMBER, 1, {})) : std::nullopt;
    };
    return {find, QStringList(QStringLiteral("Number"))};
}

/// Reads what is hard on a reader whose steps look around themselves. @param items  must be read
template <typename List, typename... Arguments>
void readAll(benchmark::State &state, const std::string &text, std::size_t items, const Arguments &...arguments)
{
    const auto file = kareport::FileBytes::holding(QStringLiteral("bench"), QByteArray::fromStdString(text));
    const ProcessorTime time;
    for (auto _ : state) {
        List list(file, arguments..., oneVariable(), {});
        std::size_t rows = 0;
        while (list.GetAt(rows) != nullptr) {
            ++rows;
        }
        if (rows != items || list.error()) {
            state.SkipWithError("rows were lost");
        }
    }
    time.report(state, static_cast<double>(state.range(0)));
}

/// A file of one column whose rows are blank lines, but for the last one.
void readBlankCsv(benchmark::State &state)
{
    const auto count = static_cast<std::size_t>(state.range(0));
    readAll<kareport::CsvObjectList>(state, "Number\n" + std::string(count, '\n') + "1\n", count + 1,
                                     kareport::CsvDialect());
}

/// A header row of very many names.
void readWideCsv(benchmark::State &state)
{
    std::string header = "Number";
    for (qint64 i = 0; i < state.range(0); ++i) {
        header += ",x";
        header += std::to_string(i);
    }
    readAll<kareport::CsvObjectList>(state, header + '\n', 0, kareport::CsvDialect());
}

/// Objects in one line, each of the first 10,000 with a key of its own.
void readJsonLine(benchmark::State &state)
{
    std::string text = "[{\"Number\":0}";
    for (qint64 i = 0; i < state.range(0); ++i) {
        text += ",{\"Number\":1,\"k" + std::to_string(i) + "\":\"" + std::string(1000, 'x') + "\"}";
    }
    readAll<kareport::JsonFileList>(state, text + ']', static_cast<std::size_t>(state.range(0)) + 1,
                                    std::vector<kareport::ColumnChoice>());
}
BENCHMARK(readBlankCsv)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(readWideCsv)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);
BENCHMARK(readJsonLine)->Arg(1'000)->Arg(10'000)->Unit(benchmark::kMillisecond);
BENCHMARK(readCsv)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

} // namespace
