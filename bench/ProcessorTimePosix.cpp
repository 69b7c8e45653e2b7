#include "ProcessorTime.h"

#include <ctime>
#include <sys/resource.h>

namespace
{

rusage usageOfProcess()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage;
}

double nanoseconds(const timeval &time)
{
    return static_cast<double>(time.tv_sec) * 1e9 + static_cast<double>(time.tv_usec) * 1e3;
}

} // namespace

long peakMemory()
{
    return usageOfProcess().ru_maxrss;
}

double threadMilliseconds()
{
    timespec now{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) * 1e3 + static_cast<double>(now.tv_nsec) / 1e6;
}

ProcessorTime::Used ProcessorTime::used()
{
    const rusage usage = usageOfProcess();
    return {nanoseconds(usage.ru_utime), nanoseconds(usage.ru_stime)};
}
