#include "Session.h"

#include "Profile.h"

#include <QJsonArray>
#include <QJsonDocument>

namespace kareport
{

namespace
{

const QString sessionEntry = QStringLiteral("Session");

} // namespace

QStringList lastSession()
{
    QStringList files;
    const QJsonDocument kept = QJsonDocument::fromJson(GetProfileString(QString(), sessionEntry).toUtf8());
    for (const QJsonValue &file : kept.array()) {
        if (!file.toString().isEmpty()) {
            files.append(file.toString());
        }
    }
    return files;
}

void keepSession(const QStringList &files)
{
    WriteProfileString(
        QString(), sessionEntry,
        QString::fromUtf8(QJsonDocument(QJsonArray::fromStringList(files)).toJson(QJsonDocument::Compact)));
}

} // namespace kareport
