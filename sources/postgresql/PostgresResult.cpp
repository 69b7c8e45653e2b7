#include "PostgresResult.h"

#include "Xlate.h"

namespace kareport
{

namespace
{

void clearResult(PGresult *result)
{
    libPq().clear(result);
}

} // namespace

PostgresResult resultOf(PGresult *result)
{
    return {result, clearResult};
}

PostgresResult noResult()
{
    return resultOf(nullptr);
}

QString lineOf(const char *text)
{
    return QString::fromUtf8(text).simplified();
}

QString reasonOf(const PGresult *result)
{
    const LibPq &pq = libPq();
    const QString message = lineOf(pq.resultErrorField(result, PG_DIAG_MESSAGE_PRIMARY));
    if (message.isEmpty()) {
        return lineOf(pq.resultErrorMessage(result));
    }
    const QString position = lineOf(pq.resultErrorField(result, PG_DIAG_STATEMENT_POSITION));
    const QString detail = lineOf(pq.resultErrorField(result, PG_DIAG_MESSAGE_DETAIL));
    return message + (position.isEmpty() ? QString() : u' ' + Xlate("(character %1 of the query)").arg(position)) +
           (detail.isEmpty() ? QString() : QStringLiteral(". ") + detail);
}

} // namespace kareport
