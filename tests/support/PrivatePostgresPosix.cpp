#include "PrivatePostgresPosix.h"

#include <QFile>

#include <gtest/gtest.h>

#include <csignal>

#include <libpq-fe.h>

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
    PGconn *connection = PQconnectdb(this->connection().toUtf8().constData());
    PGresult *result = PQexec(connection, sql.constData());
    const ExecStatusType status = PQresultStatus(result);
    EXPECT_TRUE(status == PGRES_COMMAND_OK || status == PGRES_TUPLES_OK) << PQerrorMessage(connection);
    PQclear(result);
    PQfinish(connection);
}

void PrivatePostgres::kill()
{
    QFile number(folder_.filePath(QStringLiteral("server.pid")));
    ASSERT_TRUE(number.open(QIODevice::ReadOnly));
    ::kill(number.readAll().trimmed().toInt(), SIGQUIT);
}
