#include "FileSizeLimit.h"

#include <csignal>
#include <sys/resource.h>

struct FileSizeLimit::Usual
{
    void (*handler)(int);
    rlimit limit;
};

FileSizeLimit::FileSizeLimit(quint64 bytes) : usual_(std::make_unique<Usual>())
{
    usual_->handler = std::signal(SIGXFSZ, SIG_IGN);
    getrlimit(RLIMIT_FSIZE, &usual_->limit);
    rlimit limit = usual_->limit;
    limit.rlim_cur = bytes;
    setrlimit(RLIMIT_FSIZE, &limit);
}

FileSizeLimit::~FileSizeLimit()
{
    setrlimit(RLIMIT_FSIZE, &usual_->limit);
    std::signal(SIGXFSZ, usual_->handler);
}
