#include "Folders.h"

#include "Profile.h"

#include <QDir>
#include <QFileInfo>
#include <QStandardPaths>

namespace
{

/// The current folder when the program was loaded; a program may change it later.
const QString startedIn = QDir::currentPath();

struct Folders
{
    QString library;
    QString start;
};

Folders &folders()
{
    static Folders set;
    return set;
}

} // namespace

QString GetLibraryDir(bool /*reserved*/)
{
    if (!folders().library.isEmpty()) {
        return folders().library;
    }
    // The user's own folder comes first, then those of the system.
    const QString name = QStringLiteral("kareport/templates");
    const QString installed =
        QStandardPaths::locate(QStandardPaths::GenericDataLocation, name, QStandardPaths::LocateDirectory);
    return installed.isEmpty() ? QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) + u'/' + name
                               : installed;
}

QString GetStartPathName()
{
    return folders().start.isEmpty() ? startedIn : folders().start;
}

QString GetTempDir(bool /*reserved*/)
{
    return QDir::tempPath();
}

int IsFileExisting(const QString &path)
{
    return QFileInfo(path).isFile() ? 1 : 0;
}

QString GetInitialOpenDir(const QString &key)
{
    const QString folder = GetProfileString(QString(), key);
    return QFileInfo(folder).isDir() ? folder : QString();
}

void SetLastOpenDir(const QString &path, const QString &key)
{
    WriteProfileString(QString(), key, QFileInfo(path).absolutePath());
}

namespace kareport
{

void setLibraryDir(const QString &path)
{
    folders().library = path;
}

void setStartPathName(const QString &path)
{
    folders().start = path;
}

} // namespace kareport
