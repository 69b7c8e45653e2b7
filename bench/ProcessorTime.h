#pragma once

/// The peak memory of the process in KB.
long peakMemory();

/// The processor time of this thread in milliseconds: on a machine that others use as well, what a piece of work takes
/// alone.
double threadMilliseconds();

/// Splits the time of a benchmark into the program's own and the system's, per item: where memory is fetched from the
/// system, how fast the system gives pages says nothing about how our cost grows.
class ProcessorTime
{
public:
    ProcessorTime() : begin_(used()) {}

    /// @param state  the benchmark's, which gets the two times. @param items  of one iteration
    template <typename State>
    void report(State &state, double items) const
    {
        const Used end = used();
        const double all = items * static_cast<double>(state.iterations());
        state.counters["own_ns"] = (end.own - begin_.own) / all;
        state.counters["system_ns"] = (end.system - begin_.system) / all;
    }

private:
    /// What the process has taken so far, in nanoseconds.
    struct Used
    {
        double own;
        double system;
    };

    static Used used();

    Used begin_;
};
