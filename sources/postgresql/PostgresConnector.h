#pragma once

#include "LibPq.h"

#include <QByteArray>

#include <functional>
#include <utility>

namespace kareport
{

/// How an attempt to connect ended.
enum class Connecting
{
    Done, ///< the connection is made, or says what is wrong
    Stopped,
    TimedOut
};

/// Connects to a server on a thread of its own, as finding the address of a server may take long and cannot be ended.
/// @param isToStop  is asked a few times a second
/// @return how it ended, and the connection, which the caller finishes; null unless it is done
/// @throws std::bad_alloc
std::pair<Connecting, PGconn *> connectTo(const QByteArray &connection, const std::function<bool()> &isToStop);

/// Asks a server to end the query of a connection. A server that does not answer at once is not waited for.
void cancelQuery(PGconn *connection);

} // namespace kareport
