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
    /// @param changed  called a moment after a change, so that a file written in pieces is told once
    explicit FileWatch(std::function<void(const QString &path)> changed);

    /// Watches a file, as it is now: what it holds was read or written by this program.
    void watch(const QString &path);
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
};

} // namespace kareport
