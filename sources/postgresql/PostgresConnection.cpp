#include "PostgresConnection.h"

#include "Interrupt.h"
#include "PostgresConnector.h"
#include "PostgresResult.h"
#include "SocketWait.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr int pollMilliseconds = 50;

using Options = std::unique_ptr<PQconninfoOption, void (*)(PQconninfoOption *)>;

} // namespace

PostgresConnection::PostgresConnection(const QString &connection, const std::function<bool()> &isToStop)
    : name_(QStringLiteral("postgresql")), isToStop_(&isToStop)
{
    if (!pq_.isLoaded) {
        error_ = InputError{name_, std::nullopt,
                            Xlate("the library libpq cannot be loaded: the package libpq5 was expected")};
    } else if (check(connection) && connect(connection.toUtf8())) {
        begin();
    }
    isToStop_ = nullptr;
}

PostgresConnection::~PostgresConnection()
{
    if (isRunning_) {
        cancel();
    }
    if (connection_ != nullptr) {
        pq_.finish(connection_);
    }
}

/// A job goes from hand to hand, so that a secret does not belong into it. @return whether it has none
bool PostgresConnection::check(const QString &connection)
{
    char *message = nullptr;
    const Options options(pq_.conninfoParse(connection.toUtf8().constData(), &message), pq_.conninfoFree);
    const QString reason = lineOf(message);
    pq_.freemem(message);
    if (!options) {
        error_ = InputError{
            name_, std::nullopt,
            Xlate("this is not a connection: %1. Words such as service=survey, host=..., port=..., dbname=... "
                  "and user=... were expected")
                .arg(reason)};
        return false;
    }
    for (const PQconninfoOption *option = options.get(); option->keyword != nullptr; ++option) {
        const QByteArray keyword = option->keyword;
        const bool isSecret = keyword == "password" || keyword == "sslpassword" || keyword == "passfile";
        if (isSecret && option->val != nullptr) {
            error_ = InputError{
                name_, std::nullopt,
                Xlate(
                    "a connection cannot contain \"%1\": remove it, and put the password into your password file (~/.pgpass) or into PGPASSWORD")
                    .arg(QString::fromUtf8(keyword))};
            return false;
        }
    }
    name_ = connection.simplified();
    return true;
}

bool PostgresConnection::isStopped() const
{
    return isStopped_ || isInterrupted() || (isToStop_ != nullptr && (*isToStop_)());
}

std::shared_ptr<void> PostgresConnection::stopWhen(const std::function<bool()> &isToStop)
{
    isToStop_ = &isToStop;
    return {nullptr, [this](void *) { isToStop_ = nullptr; }};
}

bool PostgresConnection::resume()
{
    isStopped_ = false;
    return !error_ && !isRunning_ && !isCancelled_ && pq_.transactionStatus(connection_) == PQTRANS_INTRANS;
}

bool PostgresConnection::connect(const QByteArray &connection)
{
    const auto [state, made] = connectTo(connection, [this] { return isStopped(); });
    connection_ = made;
    if (state == Connecting::Stopped) {
        isStopped_ = true;
        return false;
    }
    if (state == Connecting::TimedOut) {
        error_ = InputError{name_, std::nullopt, Xlate("the server does not answer")};
        return false;
    }
    if (pq_.status(connection_) != CONNECTION_OK) {
        error_ =
            InputError{name_, std::nullopt,
                       pq_.connectionNeedsPassword(connection_) != 0
                           ? Xlate("the server asks for a password: it was expected in the user's own password file "
                                   "(~/.pgpass) or in PGPASSWORD")
                           : Xlate("the server cannot be connected to: %1").arg(lineOf(pq_.errorMessage(connection_)))};
        return false;
    }
    if (pq_.setnonblocking(connection_, 1) != 0) { // a long query must not be waited for until a server takes it
        error_ = failure();
        return false;
    }
    pq_.setErrorVerbosity(connection_, PQERRORS_TERSE);
    pq_.setNoticeProcessor(
        connection_, [](void *, const char *) {}, nullptr);
    return true;
}

bool PostgresConnection::begin()
{
    // Rows of a table that is read again come in the same order, and values are written in one way, whatever is set.
    for (const char *sql :
         {"BEGIN TRANSACTION ISOLATION LEVEL REPEATABLE READ READ ONLY", "SET LOCAL datestyle = 'ISO'",
          "SET LOCAL intervalstyle = 'postgres'", "SET LOCAL extra_float_digits = 1", "SET LOCAL bytea_output = 'hex'",
          "SET LOCAL synchronize_seqscans = off"})
    {
        if (!expect(ask(sql), PGRES_COMMAND_OK)) {
            error_ = isStopped_ ? std::nullopt : std::optional(failure());
            return false;
        }
    }
    return true;
}

/// Takes an answer that is as it should be; otherwise keeps why not, and there is none.
PostgresResult PostgresConnection::expect(PostgresResult result, ExecStatusType status)
{
    if (!result || pq_.resultStatus(result.get()) == status) {
        return result;
    }
    reason_ = reasonOf(result.get());
    return noResult();
}

void PostgresConnection::cancel()
{
    cancelQuery(connection_);
    isRunning_ = false;
    isCancelled_ = true;
}

/// Waits until all that was asked is sent. @return false when the connection is lost, or when it is to stop
bool PostgresConnection::flush()
{
    for (;;) {
        const int state = pq_.flush(connection_);
        if (state == 0) {
            return true;
        }
        if (isToEnd()) {
            return false;
        }
        // A server that has something to say first takes nothing until that is read.
        if (state < 0 || !takeInput(true)) {
            return failLost();
        }
    }
}

/// Looks whether it is to stop, and ends what is running then.
bool PostgresConnection::isToEnd()
{
    if (!isStopped()) {
        return false;
    }
    isStopped_ = true;
    cancel();
    return true;
}

/// Waits a moment for the server, and takes what it sends. @return false when the connection is lost
bool PostgresConnection::takeInput(bool forWriting)
{
    waitForSocket(pq_.socket(connection_), forWriting, pollMilliseconds);
    return pq_.consumeInput(connection_) != 0;
}

/// Keeps why the connection is lost. @return false
bool PostgresConnection::failLost()
{
    reason_ = lineOf(pq_.errorMessage(connection_));
    isRunning_ = false;
    return false;
}

/// The next answer; null when there is no other, when the connection is lost, or when it is to stop.
PostgresResult PostgresConnection::await()
{
    reason_.clear();
    if (!flush()) {
        return noResult();
    }
    while (pq_.isBusy(connection_) != 0) {
        if (isToEnd()) {
            return noResult();
        }
        if (!takeInput(false)) {
            failLost();
            return noResult();
        }
    }
    return resultOf(pq_.getResult(connection_));
}

PostgresResult PostgresConnection::ask(const char *sql)
{
    if (pq_.sendQuery(connection_, sql) == 0) {
        reason_ = lineOf(pq_.errorMessage(connection_));
        return noResult();
    }
    PostgresResult result = await();
    while (result && await()) {
    }
    return result;
}

PostgresResult PostgresConnection::read(const char *sql)
{
    return expect(ask(sql), PGRES_TUPLES_OK);
}

PostgresResult PostgresConnection::prepare(const QString &query)
{
    const auto answerOf = [this](int isSent) {
        if (isSent == 0) {
            reason_ = lineOf(pq_.errorMessage(connection_));
            return noResult();
        }
        PostgresResult result = await();
        while (result && await()) {
        }
        return expect(std::move(result), PGRES_COMMAND_OK);
    };
    // What is asked on the way would take the place of a statement without a name.
    statement_ = "rows" + QByteArray::number(++statements_);
    if (!answerOf(pq_.sendPrepare(connection_, statement_.constData(), query.toUtf8().constData(), 0, nullptr))) {
        return noResult();
    }
    return answerOf(pq_.sendDescribePrepared(connection_, statement_.constData()));
}

bool PostgresConnection::send(const std::vector<std::optional<QByteArray>> &parameters)
{
    std::vector<const char *> values;
    for (const auto &parameter : parameters) {
        values.push_back(parameter ? parameter->constData() : nullptr);
    }
    const bool isSent = pq_.sendQueryPrepared(connection_, statement_.constData(), static_cast<int>(values.size()),
                                              values.data(), nullptr, nullptr, 0) != 0 &&
                        pq_.setSingleRowMode(connection_) != 0;
    reason_ = isSent ? QString() : lineOf(pq_.errorMessage(connection_));
    isRunning_ = isSent;
    return isSent;
}

PostgresResult PostgresConnection::next()
{
    PostgresResult result = await();
    if (!result) {
        return result;
    }
    const ExecStatusType status = pq_.resultStatus(result.get());
    if (status == PGRES_SINGLE_TUPLE) {
        return result;
    }
    while (await()) {
    }
    isRunning_ = false;
    return expect(std::move(result), PGRES_TUPLES_OK);
}

void PostgresConnection::drain()
{
    while (isRunning_ && next() && isRunning_) {
    }
}

InputError PostgresConnection::failure() const
{
    const bool isLost = pq_.status(connection_) == CONNECTION_BAD;
    const QString reason = reason_.isEmpty() ? lineOf(pq_.errorMessage(connection_)) : reason_;
    return {name_, std::nullopt,
            isLost ? Xlate("the connection to the server is lost: %1").arg(reason)
                   : Xlate("the database does not answer the query: %1").arg(reason)};
}

} // namespace kareport
