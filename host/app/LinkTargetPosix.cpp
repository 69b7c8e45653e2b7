#include "LinkTarget.h"

#include "LinkOwnersPosix.h"
#include "Xlate.h"

#include <QDir>
#include <QFile>
#include <QStringList>

#include <array>
#include <climits>
#include <optional>
#include <sys/stat.h>
#include <unistd.h>

namespace kareport
{

namespace
{

constexpr int mostLinks = 40; ///< on the way to one file, as in the system

struct stat statusOf(const QString &path, bool *exists)
{
    struct stat status = {};
    *exists = lstat(QFile::encodeName(path).constData(), &status) == 0;
    return status;
}

bool mayFollow(const QString &folder, const struct stat &link)
{
    bool exists = false;
    const struct stat status = statusOf(folder, &exists);
    return exists && mayFollowLink(status.st_mode, status.st_uid, link.st_uid, geteuid());
}

QString readLink(const QString &path)
{
    std::array<char, PATH_MAX> bytes;
    const ssize_t size = readlink(QFile::encodeName(path).constData(), bytes.data(), bytes.size());
    return size > 0 ? QFile::decodeName(QByteArray(bytes.data(), static_cast<qsizetype>(size))) : QString();
}

QStringList stepsOf(const QString &path)
{
    return path.split(u'/', Qt::SkipEmptyParts);
}

/// Follows a path step by step: every folder that a step begins in has no link in its own name any more.
class Walk
{
public:
    /// @return nothing for a link that may not be followed, which `link` names then
    std::optional<QString> target(const QString &path)
    {
        const QString whole = QDir::isAbsolutePath(path) ? path : QDir::currentPath() + u'/' + path;
        QStringList left = stepsOf(whole);
        QString folder = QStringLiteral("/");
        for (int links = 0; !left.isEmpty();) {
            const QString step = left.takeFirst();
            if (step == u"..") {
                folder = folder.left(qMax(folder.lastIndexOf(u'/'), 1));
                continue;
            }
            const QString next = step == u"." ? folder : QDir(folder).filePath(step);
            bool exists = false;
            const struct stat status = statusOf(next, &exists);
            if (!exists && !left.isEmpty()) {
                return path;
            }
            if (!exists || !S_ISLNK(status.st_mode)) {
                folder = next;
                continue;
            }
            if (!mayFollow(folder, status)) {
                link = next;
                return std::nullopt;
            }
            const QString target = readLink(next);
            if (target.isEmpty() || ++links > mostLinks) {
                return path;
            }
            folder = QDir::isAbsolutePath(target) ? QStringLiteral("/") : folder;
            left = stepsOf(target) + left;
        }
        return folder;
    }

    QString link;
};

} // namespace

bool mayFollowLink(unsigned folderMode, unsigned folderOwner, unsigned linkOwner, unsigned user)
{
    constexpr unsigned openToAll = S_ISVTX | S_IWOTH;
    return linkOwner == user || (folderMode & openToAll) != openToAll || linkOwner == folderOwner;
}

QString linkTarget(const QString &path, QString *error)
{
    Walk walk;
    const auto target = path.isEmpty() ? path : walk.target(path);
    if (!target && error != nullptr) {
        *error = Xlate("the link \"%1\" belongs to another user and is in a folder that everybody can write to")
                     .arg(walk.link);
    }
    return target.value_or(QString());
}

} // namespace kareport
