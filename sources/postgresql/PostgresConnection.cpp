#include "PostgresConnection.h"

#include "Interrupt.h"
#include "SocketWait.h"
#include "Xlate.h"

#include <algorithm>
#include <array>
#include <new>

namespace kareport
{

namespace
{

constexpr int waitMilliseconds = 50;
/// What is asked on the way would take the place of a statement without a name.
constexpr const char *statementName = "rows";
/// How long a connection is waited for where nothing else is said.
constexpr int mostMilliseconds = 60'000;

PostgresResult noResult()
{
    return {nullptr, PQclear};
}

QString lineOf(const char *text)
{
    return QString::fromUtf8(text).simplified();
}

/// What the server says, with the place in the query.
QString reasonOf(const PGresult *result)
{
    const QString message = lineOf(PQresultErrorField(result, PG_DIAG_MESSAGE_PRIMARY));
    if (message.isEmpty()) {
        return lineOf(PQresultErrorMessage(result));
    }
    const QString position = lineOf(PQresultErrorField(result, PG_DIAG_STATEMENT_POSITION));
    const QString detail = lineOf(PQresultErrorField(result, PG_DIAG_MESSAGE_DETAIL));
    return message + (position.isEmpty() ? QString() : u' ' + Xlate("(character %1 of the query)").arg(position)) +
           (detail.isEmpty() ? QString() : QStringLiteral(". ") + detail);
}

using Options = std::unique_ptr<PQconninfoOption, void (*)(PQconninfoOption *)>;

} // namespace

PostgresConnection::PostgresConnection(const QString &connection, const std::function<bool()> &isToStop)
    : name_(QStringLiteral("postgresql")), isToStop_(&isToStop)
{
    if (check(connection) && connect(connection.toUtf8())) {
        begin();
    }
    isToStop_ = nullptr;
}

PostgresConnection::~PostgresConnection()
{
    if (isRunning_) {
        cancel();
    }
    PQfinish(connection_);
}

/// A job goes from hand to hand, so that a secret does not belong into it. @return whether it has none
bool PostgresConnection::check(const QString &connection)
{
    char *message = nullptr;
    const Options options(PQconninfoParse(connection.toUtf8().constData(), &message), PQconninfoFree);
    const QString reason = lineOf(message);
    PQfreemem(message);
    if (!options) {
        error_ =
            InputError{name_, std::nullopt,
                       Xlate("this is no connection: %1. Words such as service=survey, host=..., port=..., dbname=... "
                             "and user=... were expected")
                           .arg(reason)};
        return false;
    }
    for (const PQconninfoOption *option = options.get(); option->keyword != nullptr; ++option) {
        const QByteArray keyword = option->keyword;
        const bool isSecret = keyword == "password" || keyword == "sslpassword" || keyword == "passfile";
        if (isSecret && option->val != nullptr) {
            error_ =
                InputError{name_, std::nullopt,
                           Xlate("a connection has no \"%1\": a password is read from the user's own password file "
                                 "(~/.pgpass) or from PGPASSWORD")
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

bool PostgresConnection::mayStillConnect(int waited) const
{
    const Options options(PQconninfo(connection_), PQconninfoFree);
    int most = mostMilliseconds;
    for (const PQconninfoOption *option = options.get(); option != nullptr && option->keyword != nullptr; ++option) {
        const int seconds = qstrcmp(option->keyword, "connect_timeout") == 0 ? QByteArray(option->val).toInt() : 0;
        most = seconds > 0 ? std::min(seconds, 100'000) * 1000 : most;
    }
    return waited < most;
}

bool PostgresConnection::connect(const QByteArray &connection)
{
    // Of a keyword that stands twice the last counts.
    const std::array<const char *, 4> keywords = {"dbname", "client_encoding", "fallback_application_name", nullptr};
    const std::array<const char *, 4> values = {connection.constData(), "UTF8", "kareport", nullptr};
    connection_ = PQconnectStartParams(keywords.data(), values.data(), 1);
    if (connection_ == nullptr) {
        throw std::bad_alloc();
    }
    PostgresPollingStatusType state = PGRES_POLLING_WRITING;
    int waited = 0;
    while (PQstatus(connection_) != CONNECTION_BAD && state != PGRES_POLLING_OK && state != PGRES_POLLING_FAILED) {
        if (isStopped()) {
            isStopped_ = true;
            return false;
        }
        if (!mayStillConnect(waited)) {
            error_ = InputError{name_, std::nullopt, Xlate("the server does not answer")};
            return false;
        }
        waitForSocket(PQsocket(connection_), state == PGRES_POLLING_WRITING, waitMilliseconds);
        waited += waitMilliseconds;
        state = PQconnectPoll(connection_);
    }
    if (PQstatus(connection_) != CONNECTION_OK) {
        error_ =
            InputError{name_, std::nullopt,
                       PQconnectionNeedsPassword(connection_) != 0
                           ? Xlate("the server wants a password: it was expected in the user's own password file "
                                   "(~/.pgpass) or in PGPASSWORD")
                           : Xlate("the server cannot be connected to: %1").arg(lineOf(PQerrorMessage(connection_)))};
        return false;
    }
    PQsetErrorVerbosity(connection_, PQERRORS_TERSE);
    PQsetNoticeProcessor(
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
    if (!result || PQresultStatus(result.get()) == status) {
        return result;
    }
    reason_ = reasonOf(result.get());
    return noResult();
}

void PostgresConnection::cancel()
{
    std::array<char, 256> message;
    PGcancel *handle = PQgetCancel(connection_);
    if (handle != nullptr) {
        PQcancel(handle, message.data(), static_cast<int>(message.size()));
        PQfreeCancel(handle);
    }
    isRunning_ = false;
}

/// The next answer; null when there is no other, when the connection is lost, or when it is to stop.
PostgresResult PostgresConnection::await()
{
    reason_.clear();
    while (PQisBusy(connection_) != 0) {
        if (isStopped()) {
            isStopped_ = true;
            cancel();
            return noResult();
        }
        waitForSocket(PQsocket(connection_), false, waitMilliseconds);
        if (PQconsumeInput(connection_) == 0) {
            reason_ = lineOf(PQerrorMessage(connection_));
            isRunning_ = false;
            return noResult();
        }
    }
    return {PQgetResult(connection_), PQclear};
}

PostgresResult PostgresConnection::ask(const char *sql)
{
    if (PQsendQuery(connection_, sql) == 0) {
        reason_ = lineOf(PQerrorMessage(connection_));
        return noResult();
    }
    PostgresResult result = await();
    while (result && await()) {
    }
    return result;
}

PostgresResult PostgresConnection::prepare(const QString &query)
{
    const auto answerOf = [this](int isSent) {
        if (isSent == 0) {
            reason_ = lineOf(PQerrorMessage(connection_));
            return noResult();
        }
        PostgresResult result = await();
        while (result && await()) {
        }
        return expect(std::move(result), PGRES_COMMAND_OK);
    };
    if (!answerOf(PQsendPrepare(connection_, statementName, query.toUtf8().constData(), 0, nullptr))) {
        return noResult();
    }
    return answerOf(PQsendDescribePrepared(connection_, statementName));
}

bool PostgresConnection::send(const std::vector<std::optional<QByteArray>> &parameters)
{
    std::vector<const char *> values;
    for (const auto &parameter : parameters) {
        values.push_back(parameter ? parameter->constData() : nullptr);
    }
    const bool isSent = PQsendQueryPrepared(connection_, statementName, static_cast<int>(values.size()), values.data(),
                                            nullptr, nullptr, 0) != 0 &&
                        PQsetSingleRowMode(connection_) != 0;
    reason_ = isSent ? QString() : lineOf(PQerrorMessage(connection_));
    isRunning_ = isSent;
    return isSent;
}

PostgresResult PostgresConnection::next()
{
    PostgresResult result = await();
    if (!result) {
        return result;
    }
    const ExecStatusType status = PQresultStatus(result.get());
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
    const bool isLost = PQstatus(connection_) == CONNECTION_BAD;
    const QString reason = reason_.isEmpty() ? lineOf(PQerrorMessage(connection_)) : reason_;
    return {name_, std::nullopt,
            isLost ? Xlate("the connection to the server is lost: %1").arg(reason)
                   : Xlate("the database does not answer the query: %1").arg(reason)};
}

} // namespace kareport
