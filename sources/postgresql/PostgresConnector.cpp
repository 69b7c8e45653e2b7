#include "PostgresConnector.h"

#include "SocketWait.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <condition_variable>
#include <memory>
#include <mutex>
#include <new>
#include <system_error>
#include <thread>

namespace kareport
{

namespace
{

constexpr int waitMilliseconds = 50;
/// How long a connection is waited for where nothing else is said.
constexpr int mostMilliseconds = 60'000;
constexpr std::chrono::milliseconds mostCancelling(1000);

/// What a thread that connects shares with the one that waits for it. The first may go on when the second has left.
struct Attempt
{
    std::mutex mutex;
    std::condition_variable ended;
    bool isEnded = false;
    bool isAbandoned = false; ///< the connection is no longer wanted
    bool isTimedOut = false;
    PGconn *connection = nullptr;
};

bool isAbandoned(Attempt &attempt)
{
    const std::lock_guard lock(attempt.mutex);
    return attempt.isAbandoned;
}

/// How long the connection may take, in milliseconds, as its words or the environment say.
int mostOf(PGconn *connection)
{
    const LibPq &pq = libPq();
    const std::unique_ptr<PQconninfoOption, decltype(pq.conninfoFree)> options(pq.conninfo(connection),
                                                                               pq.conninfoFree);
    int most = mostMilliseconds;
    for (const PQconninfoOption *option = options.get(); option != nullptr && option->keyword != nullptr; ++option) {
        const int seconds = qstrcmp(option->keyword, "connect_timeout") == 0 ? QByteArray(option->val).toInt() : 0;
        most = seconds > 0 ? std::min(seconds, 100'000) * 1000 : most;
    }
    return most;
}

void connect(const QByteArray &words, Attempt &attempt)
{
    const LibPq &pq = libPq();
    // Of a keyword that occurs twice the last counts.
    const std::array<const char *, 4> keywords = {"dbname", "client_encoding", "fallback_application_name", nullptr};
    const std::array<const char *, 4> values = {words.constData(), "UTF8", "kareport", nullptr};
    PGconn *connection = pq.connectStartParams(keywords.data(), values.data(), 1);
    PostgresPollingStatusType state = PGRES_POLLING_WRITING;
    const int most = connection != nullptr ? mostOf(connection) : 0;
    int waited = 0;
    while (connection != nullptr && pq.status(connection) != CONNECTION_BAD && state != PGRES_POLLING_OK &&
           state != PGRES_POLLING_FAILED && waited < most && !isAbandoned(attempt))
    {
        waitForSocket(pq.socket(connection), state == PGRES_POLLING_WRITING, waitMilliseconds);
        waited += waitMilliseconds;
        state = pq.connectPoll(connection);
    }
    const std::lock_guard lock(attempt.mutex);
    attempt.isTimedOut = connection != nullptr && waited >= most;
    if (attempt.isAbandoned || attempt.isTimedOut) {
        pq.finish(connection);
        connection = nullptr;
    }
    attempt.connection = connection;
    attempt.isEnded = true;
    attempt.ended.notify_all();
}

} // namespace

std::pair<Connecting, PGconn *> connectTo(const QByteArray &connection, const std::function<bool()> &isToStop)
{
    const auto attempt = std::make_shared<Attempt>();
    try {
        std::thread([attempt, connection] { connect(connection, *attempt); }).detach();
    } catch (const std::system_error &) {
        connect(connection, *attempt); // the user has as many threads as are allowed
    }
    std::unique_lock lock(attempt->mutex);
    while (!attempt->isEnded) {
        attempt->ended.wait_for(lock, std::chrono::milliseconds(waitMilliseconds));
        if (!attempt->isEnded && isToStop()) {
            attempt->isAbandoned = true;
            return {Connecting::Stopped, nullptr};
        }
    }
    if (attempt->isTimedOut) {
        return {Connecting::TimedOut, nullptr};
    }
    if (attempt->connection == nullptr) {
        throw std::bad_alloc();
    }
    return {Connecting::Done, attempt->connection};
}

void cancelQuery(PGconn *connection)
{
    const LibPq &pq = libPq();
    PGcancel *handle = pq.getCancel(connection);
    if (handle == nullptr) {
        return;
    }
    const auto attempt = std::make_shared<Attempt>();
    try {
        std::thread([attempt, handle, &pq] {
            std::array<char, 256> message;
            pq.cancel(handle, message.data(), static_cast<int>(message.size()));
            pq.freeCancel(handle);
            const std::lock_guard lock(attempt->mutex);
            attempt->isEnded = true;
            attempt->ended.notify_all();
        }).detach();
    } catch (const std::system_error &) {
        pq.freeCancel(handle); // the server notices when the connection is closed
        return;
    }
    std::unique_lock lock(attempt->mutex);
    attempt->ended.wait_for(lock, mostCancelling, [&attempt] { return attempt->isEnded; });
}

} // namespace kareport
