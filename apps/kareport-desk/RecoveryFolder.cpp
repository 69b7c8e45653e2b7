#include "RecoveryFolder.h"

#include "ReplaceFile.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonValue>
#include <QRegularExpression>
#include <QUuid>

namespace kareport
{

namespace
{

const QString lockName = QStringLiteral("lock");
const QString listName = QStringLiteral("reports.json");

/// Texts have numbers for names.
bool isTextName(const QString &name)
{
    static const QRegularExpression number(QStringLiteral("\\A[0-9]+\\z"));
    return number.match(name).hasMatch();
}

/// What a program that was killed while it wrote leaves next to the file that it would have replaced.
bool isHalfWritten(const QString &name)
{
    static const QRegularExpression form(QStringLiteral("\\A(?:[0-9]+|reports\\.json)\\.[A-Za-z0-9]{6}\\z"));
    return form.match(name).hasMatch();
}

/// Whether there is a file of a name, and not a link or a pipe.
bool isPlainFile(const QString &path)
{
    const QFileInfo info(path);
    return info.isFile() && !info.isSymLink();
}

bool isMissing(const QString &path)
{
    const QFileInfo info(path);
    return !info.exists() && !info.isSymLink();
}

} // namespace

QString RecoveryFolder::at(const QString &name) const
{
    return path_ + u'/' + name;
}

bool RecoveryFolder::isPlainFolder() const
{
    const QFileInfo info(path_);
    return info.isDir() && !info.isSymLink();
}

bool RecoveryFolder::isOurs() const
{
    const bool isNamed = !QUuid(QFileInfo(path_).fileName()).isNull();
    return isPlainFolder() && (isNamed || isPlainFile(at(listName))) &&
           (isPlainFile(at(lockName)) || isMissing(at(lockName)));
}

std::unique_ptr<QLockFile> RecoveryFolder::makeLock() const
{
    auto lock = std::make_unique<QLockFile>(at(lockName));
    lock->setStaleLockTime(0); // however long a program runs, its lock holds
    return lock;
}

std::optional<QJsonArray> RecoveryFolder::list() const
{
    QFile file(at(listName));
    if (!isPlainFolder() || !isPlainFile(file.fileName()) || !file.open(QIODevice::ReadOnly)) {
        return std::nullopt;
    }
    const QJsonDocument document = QJsonDocument::fromJson(file.readAll());
    return document.isArray() ? std::optional(document.array()) : std::nullopt;
}

bool RecoveryFolder::isUnused() const
{
    return isMissing(at(listName)) && ownNames().isEmpty();
}

QString RecoveryFolder::textFile(const QString &name) const
{
    return at(QFileInfo(name).fileName());
}

bool RecoveryFolder::holdsText(const QString &name) const
{
    const QString file = QFileInfo(name).fileName();
    return isPlainFolder() && isTextName(file) && isPlainFile(at(file));
}

bool RecoveryFolder::write(const QString &name, const std::function<bool(QIODevice &)> &write) const
{
    if (QFileInfo(at(name)).isSymLink()) {
        QFile::remove(at(name)); // the link, and not what it leads to
    }
    return isPlainFolder() && replaceFile(at(name), write);
}

bool RecoveryFolder::writeList(const QByteArray &bytes) const
{
    return write(listName, [&bytes](QIODevice &device) { return device.write(bytes) == bytes.size(); });
}

void RecoveryFolder::removeText(const QString &name) const
{
    if (isPlainFolder() && isTextName(name)) {
        QFile::remove(at(name));
    }
}

QStringList RecoveryFolder::ownNames() const
{
    QStringList names;
    // Where the folder's name does not say that a program made it, only the list says which texts are a program's.
    const bool isNamed = !QUuid(QFileInfo(path_).fileName()).isNull();
    QStringList listed;
    for (const QJsonValue entry : list().value_or(QJsonArray())) {
        listed.append(entry[QStringLiteral("text")].toString());
    }
    for (const QString &name : QDir(path_).entryList(QDir::Files | QDir::Hidden)) {
        if (isTextName(name) ? isNamed || listed.contains(name) : isHalfWritten(name)) {
            names.append(name);
        }
    }
    return names;
}

void RecoveryFolder::removeFiles() const
{
    if (!isPlainFolder()) {
        return;
    }
    for (const QString &name : ownNames()) {
        QFile::remove(at(name));
    }
    QFile::remove(at(listName));
}

void RecoveryFolder::removeIfEmpty() const
{
    if (isPlainFolder()) {
        QDir().rmdir(path_);
    }
}

} // namespace kareport
