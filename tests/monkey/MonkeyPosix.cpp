#include "WorkerExit.h"
#include "World.h"

#include <QFile>

#include <algorithm>
#include <csignal>
#include <sys/resource.h>
#include <unistd.h>

namespace monkey
{

void dieAtOnce()
{
    ::kill(::getpid(), SIGKILL);
    ::_exit(1); // not reached
}

bool isDeathAtOnce(int exitCode)
{
    return exitCode == SIGKILL;
}

void limitFiles(qint64 bytes)
{
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit limit{};
    ::getrlimit(RLIMIT_FSIZE, &limit);
    limit.rlim_cur = bytes < 0 ? limit.rlim_max : static_cast<rlim_t>(bytes);
    ::setrlimit(RLIMIT_FSIZE, &limit);
}

qint64 fileLimit()
{
    rlimit limit{};
    ::getrlimit(RLIMIT_FSIZE, &limit);
    return limit.rlim_cur == limit.rlim_max ? -1 : static_cast<qint64>(limit.rlim_cur);
}

int endEditors(const QDir &folder)
{
    int ended = 0;
    QDir editors(folder.filePath(QStringLiteral("editors")));
    for (const QString &name : editors.entryList(QDir::Files)) {
        const auto process = static_cast<pid_t>(name.toInt());
        ended += process > 1 && ::kill(process, SIGTERM) == 0 ? 1 : 0;
        editors.remove(name);
    }
    return ended;
}

bool isEditorOpen(const QDir &folder)
{
    const QStringList processes = QDir(folder.filePath(QStringLiteral("editors"))).entryList(QDir::Files);
    return std::any_of(processes.begin(), processes.end(), [](const QString &name) {
        const auto process = static_cast<pid_t>(name.toInt());
        return process > 1 && ::kill(process, 0) == 0;
    });
}

} // namespace monkey
