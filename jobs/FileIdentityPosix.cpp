#include "FileIdentity.h"

#include "LinkTarget.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QHash>

#include <algorithm>
#include <optional>
#include <sys/stat.h>
#include <unistd.h>

namespace kareport
{

namespace
{

std::optional<struct stat> statusOf(const QString &path)
{
    struct stat status = {};
    return stat(QFile::encodeName(path).constData(), &status) == 0 ? std::optional(status) : std::nullopt;
}

QString identityOf(const struct stat &status)
{
    return QStringLiteral("%1:%2").arg(status.st_dev).arg(status.st_ino);
}

QString withOtherCase(QString name)
{
    std::transform(name.begin(), name.end(), name.begin(),
                   [](QChar letter) { return letter.isLower() ? letter.toUpper() : letter.toLower(); });
    return name;
}

/// Whether a folder takes names that differ in their case for one: it finds a file in it by such a name.
bool ignoresCase(const QString &folder)
{
    for (QDirIterator entries(folder, QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot); entries.hasNext();) {
        entries.next();
        const QString other = withOtherCase(entries.fileName());
        if (other != entries.fileName()) {
            const auto status = statusOf(entries.filePath());
            const auto found = statusOf(folder + u'/' + other);
            return status && found && identityOf(*status) == identityOf(*found);
        }
    }
    return false;
}

/// The same, asked once for each folder.
bool ignoresCase(const QString &folder, const QString &identity)
{
    static QHash<QString, bool> known;
    auto answer = known.constFind(identity);
    return answer != known.constEnd() ? *answer : *known.insert(identity, ignoresCase(folder));
}

/// The identity of a file in a folder that is not there yet: what is missing is told apart by its name, below the last
/// folder that is there. The folders may be made before the file is: a ".." in the name then leads back out of them.
QString identityInMissingFolder(const QString &path)
{
    const QString clean = QDir::cleanPath(QFileInfo(path).absoluteFilePath());
    if (const auto status = statusOf(clean)) {
        return S_ISREG(status->st_mode) ? identityOf(*status) : QString();
    }
    QString folder = QFileInfo(clean).path();
    while (!statusOf(folder) && folder != QFileInfo(folder).path()) {
        folder = QFileInfo(folder).path();
    }
    const auto status = statusOf(folder);
    if (!status) {
        return clean;
    }
    const QString identity = identityOf(*status);
    const QString below = QDir(folder).relativeFilePath(clean);
    return identity + u'/' + (ignoresCase(folder, identity) ? below.toCaseFolded() : below);
}

} // namespace

QString fileIdentity(const QString &path)
{
    if (const auto status = statusOf(path)) {
        return S_ISREG(status->st_mode) ? identityOf(*status) : QString();
    }
    const QString target = linkTarget(path);
    const QFileInfo info(target.isEmpty() ? path : target);
    const auto folder = statusOf(info.path());
    if (!folder) {
        return identityInMissingFolder(info.filePath());
    }
    const QString identity = identityOf(*folder);
    return identity + u'/' + (ignoresCase(info.path(), identity) ? info.fileName().toCaseFolded() : info.fileName());
}

QString standardOutputIdentity()
{
    struct stat status = {};
    return fstat(STDOUT_FILENO, &status) == 0 && S_ISREG(status.st_mode) ? identityOf(status) : QString();
}

} // namespace kareport
