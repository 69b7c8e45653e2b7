#include "WriteFailure.h"

#include <cerrno>
#include <system_error>
#include <unistd.h>

namespace kareport
{

QString whyWritingFails(int handle)
{
    return write(handle, "", 1) < 0 ? QString::fromStdString(std::generic_category().message(errno)) : QString();
}

QString whySyncFails(int handle)
{
    // Other errors say that this file cannot be waited for.
    const bool isLost = fsync(handle) != 0 && (errno == EIO || errno == ENOSPC || errno == EDQUOT);
    return isLost ? QString::fromStdString(std::generic_category().message(errno)) : QString();
}

} // namespace kareport
