#pragma once

#include <QDateTime>
#include <QFileSystemWatcher>
#include <QHash>
#include <QString>
#include <QTimer>

#include <functional>

namespace kareport
{

/// Says when a file that is open here was changed by someone else.
class FileWatch
{
public:
    /// @param changed  called a moment after a change, so that a file written in pieces is reported once
    explicit FileWatch(std::function<void(const QString &path)> changed);

    /// Watches a file, as it is now: what it holds was read or written by this program.
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

        bool operator==(const Stamp &) const = default;
    };

    static Stamp stampOf(const QString &path);
    void check();

    std::function<void(const QString &)> changed_;
    QFileSystemWatcher watcher_;
    QTimer timer_;
    QHash<QString, Stamp> known_;
    QHash<QString, Stamp> expected_; ///< as the files were before they were read
};

} // namespace kareport
