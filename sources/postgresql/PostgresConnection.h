#pragma once

#include "InputError.h"
#include "PostgresResult.h"

#include <QByteArray>
#include <QString>

#include <atomic>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// A connection to a PostgreSQL server, in a transaction that only reads and sees one state of the database. Every wait ends soon
/// after `stop`.
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

    /// Has waits end when a function says so, which is asked a few times a second, as long as what comes back exists.
    [[nodiscard]] std::shared_ptr<void> stopWhen(const std::function<bool()> &isToStop);

    /// The rows of a query that was made here; null when there is no answer, which `failure` explains.
    PostgresResult read(const char *sql);
    /// Has a query prepared, in place of the one before. @return the description of its columns and parameters; null when it is wrong
    PostgresResult prepare(const QString &query);
    /// Sends the query that was prepared, whose rows come one by one from `next`.
    bool send(const std::vector<std::optional<QByteArray>> &parameters);
    /// The next row, or the end of the rows; null when something went wrong, or when it is to stop.
    PostgresResult next();
    /// Takes the rest of the rows, which are not needed, so that something else can be asked.
    void drain();

    /// What went wrong with the last answer.
    InputError failure() const;

    /// Ends what is running, from any thread.
    void stop() { isStopped_ = true; }
    /// Lets the connection be used again after `stop`. @return whether it can be: a query that was ended ends it as well
    bool resume();
    bool isStopped() const;

private:
    bool check(const QString &connection);
    bool connect(const QByteArray &connection);
    bool begin();
    void cancel();
    PostgresResult ask(const char *sql);
    bool flush();
    bool isToEnd();
    bool takeInput(bool forWriting);
    bool failLost();
    PostgresResult await();
    PostgresResult expect(PostgresResult result, ExecStatusType status);

    const LibPq &pq_ = libPq();
    QString name_;
    PGconn *connection_ = nullptr;
    std::optional<InputError> error_;
    const std::function<bool()> *isToStop_ = nullptr; ///< null where there is nothing to ask
    std::atomic<bool> isStopped_ = false;
    bool isRunning_ = false;   ///< rows may still come
    bool isCancelled_ = false; ///< a query was ended, and the transaction with it
    QByteArray statement_;     ///< the name of the query that was prepared last
    int statements_ = 0;       ///< how many were prepared
    QString reason_;           ///< of the last failure
};

} // namespace kareport
