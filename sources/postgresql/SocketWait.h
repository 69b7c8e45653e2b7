#pragma once

namespace kareport
{

/// Waits until a socket has something to read, or takes something to write, or a time is over.
void waitForSocket(int socket, bool forWriting, int milliseconds);

} // namespace kareport
