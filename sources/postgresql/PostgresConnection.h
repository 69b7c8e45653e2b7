#pragma once

#include "InputError.h"

#include <QByteArray>
#include <QString>

#include <atomic>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

#include <libpq-fe.h>

namespace kareport
{

/// An answer of a server.
using PostgresResult = std::unique_ptr<PGresult, void (*)(PGresult *)>;

/// A connection to a PostgreSQL server, in a transaction that only reads. Every wait ends soon after `stop`.
class PostgresConnection
{
public:
    /// Connects and begins the transaction. `error` says what is wrong.
    /// @param isToStop  asked a few times a second meanwhile
    PostgresConnection(const QString &connection, const std::function<bool()> &isToStop);
    ~PostgresConnection();
    PostgresConnection(const PostgresConnection &) = delete;
    PostgresConnection &operator=(const PostgresConnection &) = delete;

    const std::optional<InputError> &error() const { return error_; }
    /// What messages call it.
    const QString &name() const { return name_; }

    /// The answer to a statement that was made here; null when it has none, which `failure` explains.
    PostgresResult ask(const char *sql);
    /// Has a query prepared. @return the description of its columns and parameters; null when it is wrong
    PostgresResult prepare(const QString &query);
    /// Sends the query that was prepared, whose rows come one by one from `next`.
    bool send(const std::vector<std::optional<QByteArray>> &parameters);
    /// The next row, or the end of the rows; null when something went wrong, or when it is to stop.
    PostgresResult next();
    /// Takes the rest of the rows, which nobody wants, so that something else can be asked.
    void drain();

    /// What went wrong with the last answer.
    InputError failure() const;

    /// Ends what is running, from any thread.
    void stop() { isStopped_ = true; }
    bool isStopped() const;

private:
    bool check(const QString &connection);
    bool connect(const QByteArray &connection);
    bool begin();
    bool mayStillConnect(int waited) const;
    void cancel();
    PostgresResult await();
    PostgresResult expect(PostgresResult result, ExecStatusType status);

    QString name_;
    PGconn *connection_ = nullptr;
    std::optional<InputError> error_;
    const std::function<bool()> *isToStop_ = nullptr; ///< while connecting
    std::atomic<bool> isStopped_ = false;
    bool isRunning_ = false; ///< rows may still come
    QString reason_;         ///< of the last failure
};

} // namespace kareport
