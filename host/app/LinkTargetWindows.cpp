#include "LinkTarget.h"

#include <QDir>
#include <QFileInfo>

namespace kareport
{

namespace
{

constexpr int mostLinks = 40; ///< on the way to one file

} // namespace

// Links are made by administrators, or by users in a mode for developers; the system itself follows those among the folders.
QString linkTarget(const QString &path, QString * /*error*/)
{
    QString target = path;
    for (int links = 0; QFileInfo(target).isSymbolicLink(); ++links) {
        const QString next = QFileInfo(target).symLinkTarget();
        if (next.isEmpty() || links == mostLinks) {
            return path;
        }
        target = next;
    }
    return target == path ? path : QDir::cleanPath(target);
}

} // namespace kareport
