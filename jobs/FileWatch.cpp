#include "FileWatch.h"

#include "FileIdentity.h"

#include <QFileInfo>
#include <QSet>

#include <utility>

namespace kareport
{

namespace
{

// Milliseconds.
constexpr int settleTime = 300;
constexpr int longestWait = 2000; ///< a file that never settles is looked at all the same
constexpr int missingTime = 2000; ///< between two looks for a file whose folder cannot be watched

/// The folder that shows when a file comes or is replaced: its own, or the last one on the way to it that is there.
QString watchedFolder(const QString &path)
{
    QString folder = QFileInfo(path).absolutePath();
    while (!QFileInfo(folder).isDir() && folder != QFileInfo(folder).path()) {
        folder = QFileInfo(folder).path();
    }
    return folder;
}

} // namespace

FileWatch::FileWatch(std::function<void(const QString &path)> changed) : changed_(std::move(changed))
{
    timer_.setSingleShot(true);
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { check(); });
    QObject::connect(&watcher_, &QFileSystemWatcher::fileChanged, &timer_, [this] { noteEvent(); });
    QObject::connect(&watcher_, &QFileSystemWatcher::directoryChanged, &timer_, [this] { noteEvent(); });
}

FileWatch::Stamp FileWatch::stampOf(const QString &path)
{
    const QFileInfo info(path);
    return info.exists() ? Stamp{info.lastModified(), info.size(), fileIdentity(path)} : Stamp();
}

void FileWatch::noteEvent()
{
    if (!timer_.isActive()) {
        sinceEvent_.start();
    }
    if (!timer_.isActive() || sinceEvent_.elapsed() < longestWait) {
        timer_.start(settleTime);
    }
}

/// Has the system tell about a file. One that was replaced is another one, which it does not know yet.
void FileWatch::follow(const QString &path)
{
    if (QFileInfo::exists(path)) {
        watcher_.addPath(path);
    }
    watcher_.addPath(watchedFolder(path));
}

void FileWatch::dropFolders()
{
    QSet<QString> needed;
    for (auto file = known_.constBegin(); file != known_.constEnd(); ++file) {
        needed.insert(watchedFolder(file.key()));
    }
    for (const QString &folder : watcher_.directories()) {
        if (!needed.contains(folder)) {
            watcher_.removePath(folder);
        }
    }
}

void FileWatch::watch(const QString &path)
{
    const Stamp now = stampOf(path);
    const Stamp known = expected_.contains(path) ? expected_.take(path) : now;
    known_.insert(path, known);
    follow(path);
    // It may have changed before the system was told to watch it.
    if (known != now || stampOf(path) != now) {
        noteEvent();
    }
}

void FileWatch::expect(const QString &path)
{
    if (!path.isEmpty()) {
        expected_.insert(path, stampOf(path));
    }
}

void FileWatch::forget(const QString &path)
{
    if (known_.remove(path)) {
        watcher_.removePath(path);
        dropFolders();
    }
}

void FileWatch::retain(const QStringList &paths)
{
    for (const QString &path : known_.keys()) {
        if (!paths.contains(path)) {
            forget(path);
        }
    }
}

void FileWatch::check()
{
    QStringList changed;
    bool isLookedFor = false;
    for (auto file = known_.begin(); file != known_.end(); ++file) {
        follow(file.key());
        const Stamp stamp = stampOf(file.key());
        if (stamp.size < 0) {
            // It may be in the middle of being replaced.
            isLookedFor = isLookedFor || !watcher_.directories().contains(watchedFolder(file.key()));
        } else if (stamp != file.value()) {
            file.value() = stamp;
            changed.append(file.key());
        }
    }
    dropFolders();
    if (isLookedFor) {
        timer_.start(missingTime);
    }
    for (const QString &path : changed) {
        changed_(path);
    }
}

} // namespace kareport
