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
    PrivateCups();
    ~PrivateCups();
    PrivateCups(const PrivateCups &) = delete;
    PrivateCups &operator=(const PrivateCups &) = delete;

    bool isRunning() const { return running_; }
    /// Why there is none.
    std::string reason() { return process_.readAllStandardError().toStdString(); }
    void end();

    /// The pages of the job that arrives, after a wait; -1 when none does.
    int arrivedPages();
    /// The last job that has arrived.
    QString arrived() const { return folder_.filePath(QStringLiteral("arrived/job.pdf")); }
    /// The jobs that wait or are printed.
    int jobs();

private:
    /// The library of the print system asks for the server once.
    static void useServerOfEnvironment();

    QTemporaryDir folder_{QStringLiteral("/tmp/ka-cups-XXXXXX")};
    QProcess process_;
    QByteArray before_;
    bool running_ = false;
};
