#include "SocketWait.h"

#include <poll.h>

namespace kareport
{

void waitForSocket(int socket, bool forWriting, int milliseconds)
{
    pollfd one = {socket, static_cast<short>(forWriting ? POLLOUT : POLLIN), 0};
    // A signal ends the wait early, which does no harm: the caller looks again.
    ::poll(&one, 1, milliseconds);
}

} // namespace kareport
