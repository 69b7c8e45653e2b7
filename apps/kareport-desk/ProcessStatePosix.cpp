#include "ProcessState.h"

#include <cerrno>
#include <csignal>

namespace kareport
{

bool isProcessRunning(qint64 process)
{
    // Signal 0 only asks; another user's process must not be asked, but exists.
    return process > 0 && (::kill(static_cast<pid_t>(process), 0) == 0 || errno == EPERM);
}

} // namespace kareport
