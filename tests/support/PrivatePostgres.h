#pragma once

#include <QByteArray>
#include <QProcess>
#include <QString>
#include <QTemporaryDir>

#include <string>

/// A PostgreSQL server of one test, without any data.
class PrivatePostgres
{
public:
    PrivatePostgres();
    ~PrivatePostgres();
    PrivatePostgres(const PrivatePostgres &) = delete;
    PrivatePostgres &operator=(const PrivatePostgres &) = delete;

    bool isRunning() const { return running_; }
    /// Why there is none.
    std::string reason() { return process_.readAllStandardError().toStdString(); }

    /// How it is connected to.
    QString connection() const;
    /// The same as a user who needs the password "open sesame".
    QString guardedConnection() const;
    /// Runs SQL as the user who may do everything. A failure is one of the test.
    void runSql(const QByteArray &sql) const;
    /// Ends the server at once, with all connections.
    void kill();

private:
    QString socket() const { return folder_.filePath(QStringLiteral("socket")); }

    QTemporaryDir folder_{QStringLiteral("/tmp/ka-pg-XXXXXX")};
    QProcess process_;
    bool running_ = false;
};
