#pragma once

#include <QJsonArray>
#include <QLockFile>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>
#include <optional>

class QIODevice;

namespace kareport
{

/// The folder in which one program keeps what it has open: a list, the texts that the list names, and a lock that says
/// whether the program runs. Other files are not ours: nothing is read, written or removed through a link, and
/// only what has the names of these files is removed.
class RecoveryFolder
{
public:
    explicit RecoveryFolder(const QString &path) : path_(path) {}

    const QString &path() const { return path_; }
    /// Whether a program made it; nothing may be written into a folder that no program made.
    bool isOurs() const;
    /// The lock of its program, not yet taken.
    std::unique_ptr<QLockFile> makeLock() const;
    /// The list; nothing when it cannot be read.
    std::optional<QJsonArray> list() const;
    /// Whether a program kept nothing in it: it ended before it had anything to keep.
    bool isUnused() const;
    /// The full name of a text that the list names.
    QString textFile(const QString &name) const;
    /// Whether a text is there. @param name  its name or its full name
    bool holdsText(const QString &name) const;

    /// Writes one of the files. @return false, with an earlier file as it was, when it could not be written
    bool write(const QString &name, const std::function<bool(QIODevice &)> &write) const;
    bool writeList(const QByteArray &bytes) const;
    /// Removes a text.
    void removeText(const QString &name) const;
    /// Removes list and texts. The folder is removed as well when nothing else is in it, at the latest with
    /// `removeIfEmpty`.
    void removeFiles() const;
    void removeIfEmpty() const;

private:
    bool isPlainFolder() const;
    QString at(const QString &name) const;
    /// The files in it that a program writes, going by their names.
    QStringList ownNames() const;

    QString path_;
};

} // namespace kareport
