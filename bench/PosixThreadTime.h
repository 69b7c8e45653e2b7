#pragma once

#include <ctime>

/// The processor time of this thread in milliseconds: on a machine that others use as well, what a piece of work takes
/// alone.
inline double threadMilliseconds()
{
    timespec now{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) * 1e3 + static_cast<double>(now.tv_nsec) / 1e6;
}
