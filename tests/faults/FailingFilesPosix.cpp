#include "FailingFiles.h"

#include <cerrno>
#include <cstddef>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace
{

using Call = FailingFiles::Call;

thread_local constinit Call failing = Call::Write;
thread_local constinit qint64 left = 0;
thread_local constinit bool isRefused = false;

bool refuses(Call call, int error)
{
    if (left == 0 || call != failing || --left > 0) {
        return false;
    }
    isRefused = true;
    errno = error;
    return true;
}

/// What the test itself prints is always written, and so is what wakes an event loop.
bool isFile(int descriptor)
{
    struct stat status = {};
    return descriptor > STDERR_FILENO && ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
}

} // namespace

// In the place of the C library's own.
extern "C" {

__attribute__((visibility("default"))) ssize_t write(int descriptor, const void *bytes, std::size_t size)
{
    if (isFile(descriptor) && refuses(Call::Write, ENOSPC)) {
        return -1;
    }
    if (isFile(descriptor) && size > 1 && refuses(Call::ShortWrite, ENOSPC)) {
        failing = Call::Write;
        left = 1;
        size /= 2;
    }
    return syscall(SYS_write, descriptor, bytes, size);
}
// The disk is not waited for: a file that was written is seen without that.
__attribute__((visibility("default"))) int fsync(int /*descriptor*/)
{
    return refuses(Call::Flush, EIO) ? -1 : 0;
}
__attribute__((visibility("default"))) int fdatasync(int /*descriptor*/)
{
    return refuses(Call::Flush, EIO) ? -1 : 0;
}
__attribute__((visibility("default"))) int rename(const char *from, const char *to) noexcept
{
    return refuses(Call::Rename, EACCES) ? -1
                                         : static_cast<int>(syscall(SYS_renameat2, AT_FDCWD, from, AT_FDCWD, to, 0U));
}
}

FailingFiles::FailingFiles(Call call, qint64 number)
{
    isRefused = false;
    failing = call;
    left = number;
}

FailingFiles::~FailingFiles()
{
    left = 0;
}

bool FailingFiles::hasFailed() const
{
    return isRefused;
}
