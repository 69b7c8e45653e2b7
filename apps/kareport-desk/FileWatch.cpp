#include "FileWatch.h"

#include <QFileInfo>

#include <utility>

namespace kareport
{

namespace
{
constexpr int settleTime = 300;   // milliseconds
constexpr int missingTime = 2000; // milliseconds
} // namespace

FileWatch::FileWatch(std::function<void(const QString &path)> changed) : changed_(std::move(changed))
{
    timer_.setSingleShot(true);
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { check(); });
    QObject::connect(&watcher_, &QFileSystemWatcher::fileChanged, &timer_, [this] { timer_.start(settleTime); });
}

FileWatch::Stamp FileWatch::stampOf(const QString &path)
{
    const QFileInfo info(path);
    return info.exists() ? Stamp{info.lastModified(), info.size()} : Stamp();
}

void FileWatch::watch(const QString &path)
{
    const Stamp now = stampOf(path);
    const Stamp known = expected_.contains(path) ? expected_.take(path) : now;
    known_.insert(path, known);
    watcher_.addPath(path);
    if (known != now) {
        timer_.start(settleTime);
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
    bool isMissing = false;
    for (auto file = known_.begin(); file != known_.end(); ++file) {
        const Stamp stamp = stampOf(file.key());
        if (stamp.size < 0) {
            isMissing = true; // it may be in the middle of being replaced
            continue;
        }
        // A file that was replaced is another one, which the watcher does not know yet.
        watcher_.addPath(file.key());
        if (stamp != file.value()) {
            file.value() = stamp;
            changed.append(file.key());
        }
    }
    if (isMissing) {
        timer_.start(missingTime);
    }
    for (const QString &path : changed) {
        changed_(path);
    }
}

} // namespace kareport
