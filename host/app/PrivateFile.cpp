#include "PrivateFile.h"

#include <QFileInfo>

namespace kareport
{

bool openPrivateFile(QFile &file)
{
    return file.open(QIODevice::WriteOnly | QIODevice::NewOnly, QFile::ReadOwner | QFile::WriteOwner);
}

bool makePrivateFile(const QString &path)
{
    QFile::remove(path);
    QFile file(path);
    return openPrivateFile(file);
}

bool isNameTaken(const QString &path)
{
    const QFileInfo info(path);
    return info.exists() || info.isSymLink();
}

} // namespace kareport
