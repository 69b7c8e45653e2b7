#include "PrivatePostgres.h"

#include "PostgresConnector.h"

#include <QFile>

#include <gtest/gtest.h>

#include <csignal>

PrivatePostgres::PrivatePostgres()
{
    // The socket's path must be short, whatever folder tests are given for temporary files.
    process_.start(
        QStringLiteral(KAREPORT_SCRIPTS_DIR "/private-postgres.sh"),
        {folder_.path(), QStringLiteral("sh"), QStringLiteral("-c"), QStringLiteral("echo ready; read -r line")});
    while (process_.state() != QProcess::NotRunning && !process_.canReadLine()) {
        if (!process_.waitForReadyRead(60'000)) {
            break;
        }
    }
    running_ = process_.canReadLine() && process_.readLine() == "ready\n";
}

PrivatePostgres::~PrivatePostgres()
{
    process_.closeWriteChannel();
    process_.waitForFinished(30'000);
}

QString PrivatePostgres::connection() const
{
    return QStringLiteral("host=%1 dbname=survey user=survey").arg(socket());
}

QString PrivatePostgres::guardedConnection() const
{
    return QStringLiteral("host=%1 dbname=survey user=guarded").arg(socket());
}

void PrivatePostgres::runSql(const QByteArray &sql) const
{
    const kareport::LibPq &pq = kareport::libPq();
    PGconn *made = kareport::connectTo(connection().toUtf8(), [] { return false; }).second;
    ASSERT_EQ(pq.status(made), CONNECTION_OK) << pq.errorMessage(made);
    EXPECT_NE(pq.sendQuery(made, sql.constData()), 0);
    while (PGresult *result = pq.getResult(made)) {
        const ExecStatusType status = pq.resultStatus(result);
        EXPECT_TRUE(status == PGRES_COMMAND_OK || status == PGRES_TUPLES_OK) << pq.errorMessage(made);
        pq.clear(result);
    }
    pq.finish(made);
}

void PrivatePostgres::kill()
{
    QFile number(folder_.filePath(QStringLiteral("server.pid")));
    ASSERT_TRUE(number.open(QIODevice::ReadOnly));
    ::kill(number.readAll().trimmed().toInt(), SIGQUIT);
}
