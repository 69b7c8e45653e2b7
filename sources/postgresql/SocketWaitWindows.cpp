#include "SocketWait.h"

#include <winsock2.h>

namespace kareport
{

void waitForSocket(int socket, bool forWriting, int milliseconds)
{
    fd_set waiting;
    fd_set failed; // a connection that is refused is told about here
    FD_ZERO(&waiting);
    FD_ZERO(&failed);
    const auto one = static_cast<SOCKET>(socket);
    waiting.fd_count = 1;
    waiting.fd_array[0] = one;
    failed = waiting;
    constexpr int second = 1000;
    timeval time = {milliseconds / second, milliseconds % second * second};
    ::select(0, forWriting ? nullptr : &waiting, forWriting ? &waiting : nullptr, &failed, &time);
}

} // namespace kareport
