#pragma once

#include "NumberedPages.h"

#include <QElapsedTimer>
#include <QFileInfo>
#include <QLibrary>
#include <QProcess>
#include <QTemporaryDir>
#include <QThread>

/// A print server of one test: a default queue Whole whose jobs arrive in a file, one that refuses jobs and one that is
/// switched off. It needs neither an installed printer nor the system's print server.
class PrivateCups
{
public:
    PrivateCups()
    {
        // The socket's path must be short, whatever folder tests are given for temporary files.
        process_.start(
            QStringLiteral(KAREPORT_SCRIPTS_DIR "/private-cups.sh"),
            {folder_.path(), QStringLiteral("sh"), QStringLiteral("-c"), QStringLiteral("echo ready; read -r line")});
        while (process_.state() != QProcess::NotRunning && !process_.canReadLine()) {
            if (!process_.waitForReadyRead(10'000)) {
                break;
            }
        }
        running_ = process_.canReadLine() && process_.readLine() == "ready\n";
        if (running_) {
            const QByteArray socket = QFile::encodeName(folder_.filePath(QStringLiteral("state/cups.sock")));
            before_ = qgetenv("CUPS_SERVER");
            qputenv("CUPS_SERVER", socket);
            useServerOfEnvironment();
        }
    }
    ~PrivateCups()
    {
        end();
        if (running_) {
            before_.isNull() ? qunsetenv("CUPS_SERVER") : qputenv("CUPS_SERVER", before_);
            useServerOfEnvironment();
        }
    }
    PrivateCups(const PrivateCups &) = delete;
    PrivateCups &operator=(const PrivateCups &) = delete;

    bool isRunning() const { return running_; }
    /// Why there is none.
    std::string reason() { return process_.readAllStandardError().toStdString(); }
    void end()
    {
        process_.closeWriteChannel();
        process_.waitForFinished(10'000);
    }

    /// The pages of the job that arrives, after a wait; -1 when none does.
    int arrivedPages()
    {
        QElapsedTimer timer;
        timer.start();
        while (timer.elapsed() < 30'000 && jobs() != 0) {
            QThread::msleep(50);
        }
        return pagesIn(arrived());
    }
    /// The last job that has arrived.
    QString arrived() const { return folder_.filePath(QStringLiteral("arrived/job.pdf")); }
    /// The jobs that wait or are printed.
    int jobs()
    {
        QProcess lpstat;
        lpstat.start(QStringLiteral("lpstat"), {QStringLiteral("-o")});
        lpstat.waitForFinished();
        return static_cast<int>(lpstat.readAllStandardOutput().count('\n'));
    }

private:
    /// The library of the print system asks for the server once.
    static void useServerOfEnvironment()
    {
        QLibrary library(QStringLiteral("cups"), 2);
        if (auto *setServer = reinterpret_cast<void (*)(const char *)>(library.resolve("cupsSetServer"))) {
            setServer(nullptr);
        }
    }

    QTemporaryDir folder_{QStringLiteral("/tmp/ka-cups-XXXXXX")};
    QProcess process_;
    QByteArray before_;
    bool running_ = false;
};
