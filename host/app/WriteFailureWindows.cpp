#include "WriteFailure.h"

#include <cerrno>
#include <io.h>
#include <system_error>

namespace kareport
{

QString whyWritingFails(int handle)
{
    return _write(handle, "", 1) < 0 ? QString::fromStdString(std::generic_category().message(errno)) : QString();
}

QString whySyncFails(int handle)
{
    // Other errors say that this file cannot be waited for.
    const bool isLost = _commit(handle) != 0 && (errno == EIO || errno == ENOSPC);
    return isLost ? QString::fromStdString(std::generic_category().message(errno)) : QString();
}

} // namespace kareport
