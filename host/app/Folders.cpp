#include "Folders.h"

#include <QDir>
#include <QStandardPaths>

namespace
{

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
    return QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) +
           QStringLiteral("/kareport/templates");
}

QString GetStartPathName()
{
    return folders().start.isEmpty() ? QDir::currentPath() : folders().start;
}

QString GetTempDir(bool /*reserved*/)
{
    return QDir::tempPath();
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
