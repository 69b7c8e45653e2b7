#include "DevicePath.h"

#include <QStringList>

namespace kareport
{

namespace
{

/// Names that mean a device in every folder, whatever case and ending they have.
bool isDeviceName(const QString &name)
{
    static const QStringList names = {QStringLiteral("NUL"), QStringLiteral("CON"), QStringLiteral("AUX"),
                                      QStringLiteral("PRN")};
    const QString stem = name.section(u'.', 0, 0).trimmed().toUpper();
    const bool isPort =
        stem.size() == 4 && (stem.startsWith(u"COM") || stem.startsWith(u"LPT")) && stem[3] >= u'1' && stem[3] <= u'9';
    return isPort || names.contains(stem);
}

} // namespace

QString devicePath(const QString &path)
{
    QString native = path;
    native.replace(u'/', u'\\');
    if (native.startsWith(u"\\\\.\\")) {
        return native;
    }
    const QString name = native.sliced(native.lastIndexOf(u'\\') + 1);
    return isDeviceName(name) ? QStringLiteral("\\\\.\\") + name.section(u'.', 0, 0).trimmed() : QString();
}

} // namespace kareport
