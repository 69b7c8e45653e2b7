#pragma once

#include <QDateTime>
#include <QElapsedTimer>
#include <QFileSystemWatcher>
#include <QHash>
#include <QString>
#include <QTimer>

#include <functional>

namespace kareport
{

/// Says when another program has changed a file: written it, put another file in its place, or brought it back after it was
/// gone. It needs a running event loop and does nothing while nothing changes.
class FileWatch
{
public:
    /// @param changed  called a moment after a change, so that a file written in pieces is reported once. A file that is
    ///                 gone is not reported before it is back
    explicit FileWatch(std::function<void(const QString &path)> changed);

    /// Watches a file, as it is now: what it holds was read or written by this program. It need not exist.
    void watch(const QString &path);
    bool isWatched(const QString &path) const { return known_.contains(path); }
    /// Notes how a file is that is going to be read: the watch that begins next tells what has changed since.
    void expect(const QString &path);
    /// The file has not been read.
    void ceaseToExpect(const QString &path) { expected_.remove(path); }
    void forget(const QString &path);
    /// Forgets all files but these.
    void retain(const QStringList &paths);

private:
    /// What tells one content of a file from another without reading it.
    struct Stamp
    {
        QDateTime modified;
        qint64 size = -1; ///< -1: there is no such file
        QString identity; ///< of a file that took the place of another

        bool operator==(const Stamp &) const = default;
    };

    static Stamp stampOf(const QString &path);
    void noteEvent();
    void follow(const QString &path);
    void dropFolders();
    void check();

    std::function<void(const QString &)> changed_;
    QFileSystemWatcher watcher_;
    QTimer timer_;
    QElapsedTimer sinceEvent_; ///< since the first event that has not been looked at
    QHash<QString, Stamp> known_;
    QHash<QString, Stamp> expected_; ///< as the files were before they were read
};

} // namespace kareport
