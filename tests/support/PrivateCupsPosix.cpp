#include "PrivateCups.h"

PrivateCups::PrivateCups()
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

PrivateCups::~PrivateCups()
{
    end();
    if (running_) {
        before_.isNull() ? qunsetenv("CUPS_SERVER") : qputenv("CUPS_SERVER", before_);
        useServerOfEnvironment();
    }
}

void PrivateCups::end()
{
    process_.closeWriteChannel();
    process_.waitForFinished(10'000);
}

int PrivateCups::arrivedPages()
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < 30'000 && jobs() != 0) {
        QThread::msleep(50);
    }
    return pagesIn(arrived());
}

int PrivateCups::jobs()
{
    QProcess lpstat;
    lpstat.start(QStringLiteral("lpstat"), {QStringLiteral("-o")});
    lpstat.waitForFinished();
    return static_cast<int>(lpstat.readAllStandardOutput().count('\n'));
}

void PrivateCups::useServerOfEnvironment()
{
    QLibrary library(QStringLiteral("cups"), 2);
    if (auto *setServer = reinterpret_cast<void (*)(const char *)>(library.resolve("cupsSetServer"))) {
        setServer(nullptr);
    }
}
