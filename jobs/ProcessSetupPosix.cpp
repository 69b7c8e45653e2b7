#include "ProcessSetup.h"

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <initializer_list>
#include <poll.h>
#include <unistd.h>

namespace kareport
{

namespace
{

void fillClosedDescriptors()
{
    for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (fcntl(descriptor, F_GETFD) == -1 && errno == EBADF) {
            // The lowest free descriptor is taken, which is this one.
            open("/dev/null", descriptor == STDIN_FILENO ? O_WRONLY : O_RDONLY);
        }
    }
}

/// A handler, as programs that this one starts would inherit that a signal is switched off.
extern "C" void letTheWriteFail(int /*signal*/) {}

} // namespace

void prepareProcess()
{
    fillClosedDescriptors();
    std::signal(SIGXFSZ, letTheWriteFail);
}

bool isOutputReaderGone()
{
    pollfd output = {STDOUT_FILENO, 0, 0};
    return poll(&output, 1, 0) > 0 && (output.revents & (POLLERR | POLLHUP)) != 0;
}

void addShippedFaces()
{
    // The packages depend on that of the face.
}

} // namespace kareport
