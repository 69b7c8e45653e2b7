#pragma once

#include <csignal>
#include <sys/resource.h>

/// Lets writing to any file fail behind so many bytes, as a full disk does. For a moment only: it holds for the whole
/// process.
class PosixFileSizeLimit
{
public:
    explicit PosixFileSizeLimit(rlim_t bytes) : usualHandler_(std::signal(SIGXFSZ, SIG_IGN))
    {
        getrlimit(RLIMIT_FSIZE, &usual_);
        rlimit limit = usual_;
        limit.rlim_cur = bytes;
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~PosixFileSizeLimit()
    {
        setrlimit(RLIMIT_FSIZE, &usual_);
        std::signal(SIGXFSZ, usualHandler_);
    }
    PosixFileSizeLimit(const PosixFileSizeLimit &) = delete;
    PosixFileSizeLimit &operator=(const PosixFileSizeLimit &) = delete;

private:
    void (*usualHandler_)(int);
    rlimit usual_{};
};
