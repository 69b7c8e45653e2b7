#include "SystemPath.h"

#include <QFile>

namespace kareport
{

QByteArray pathForLibrary(const QString &path)
{
    return QFile::encodeName(path);
}

std::filesystem::path standardPath(const QString &path)
{
    return QFile::encodeName(path).toStdString();
}

QString textOfSystem(const QByteArray &bytes)
{
    return QFile::decodeName(bytes);
}

} // namespace kareport
