#include "DevicePath.h"

#include <QFileInfo>

namespace kareport
{

QString devicePath(const QString &path)
{
    const QFileInfo info(path);
    return info.exists() && !info.isFile() && !info.isDir() ? path : QString();
}

} // namespace kareport
