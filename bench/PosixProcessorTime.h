#pragma once

#include <benchmark/benchmark.h>

#include <sys/resource.h>

/// The peak memory of the process in KB.
inline long peakMemory()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss;
}

/// Splits the time of a benchmark into the program's own and the system's, per item: where memory is fetched from the
/// system, how fast the system gives pages says nothing about how our cost grows.
class ProcessorTime
{
public:
    ProcessorTime() { getrusage(RUSAGE_SELF, &begin_); }

    void report(benchmark::State &state, double items) const
    {
        rusage end{};
        getrusage(RUSAGE_SELF, &end);
        const double all = items * static_cast<double>(state.iterations());
        state.counters["own_ns"] = nanoseconds(begin_.ru_utime, end.ru_utime) / all;
        state.counters["system_ns"] = nanoseconds(begin_.ru_stime, end.ru_stime) / all;
    }

private:
    static double nanoseconds(const timeval &from, const timeval &to)
    {
        return static_cast<double>(to.tv_sec - from.tv_sec) * 1e9 +
               static_cast<double>(to.tv_usec - from.tv_usec) * 1e3;
    }

    rusage begin_{};
};
