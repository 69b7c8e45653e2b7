#include "BenchProfile.h"

#include <QApplication>

#include <benchmark/benchmark.h>

// The application of the benchmarks that show windows or print. It ends before main() does: what Qt still holds of its windows
// when the program's statics go is gone by then.

int main(int argc, char *argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    kareport::useBenchProfile();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) {
        return 1;
    }
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
