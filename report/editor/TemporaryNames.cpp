#include "TemporaryNames.h"

#include <QDir>

#include <algorithm>

namespace kareport
{

QString temporaryStem(const QString &reportFileName)
{
    QString name =
        reportFileName.mid(std::max(reportFileName.lastIndexOf(u'\\'), reportFileName.lastIndexOf(u'/')) + 1);
    const qsizetype dot = name.lastIndexOf(u'.');
    if (dot >= 0) {
        // Counted from the end, as if it were the extension: a name with one of three letters leaves nothing. Whoever
        // wants a stem of his own gives a name without extension.
        name = name.right(std::max<qsizetype>(0, name.size() - dot - 4));
    }
    return name.isEmpty() ? QStringLiteral("Report$$$") : name;
}

QString TemporaryNames::next(const QString &folder, const QString &stem)
{
    QString place = folder;
    if (!place.isEmpty() && !place.endsWith(QDir::separator())) {
        place += QDir::separator();
    }
    const QString extension = QStringLiteral(".rep");
    QString name = place + stem + extension;
    for (int number = 2; handedOut_.contains(name); ++number) {
        name = place + stem + u' ' + QString::number(number) + extension;
        if (number == lastNumber) {
            break;
        }
    }
    handedOut_.insert(name);
    return name;
}

} // namespace kareport
