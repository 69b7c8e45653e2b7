#include "ImportMemory.h"

#include "Profile.h"

#include <QJsonArray>
#include <QJsonDocument>

namespace kareport
{

namespace
{

const QString importsEntry = QStringLiteral("Imports"); // the one that was used last comes first
const QString shapeKey = QStringLiteral("shape");
const QString optionsKey = QStringLiteral("options");
constexpr qsizetype mostShapes = 50;

QJsonArray remembered()
{
    return QJsonDocument::fromJson(GetProfileString(QString(), importsEntry).toUtf8()).array();
}

} // namespace

std::optional<QJsonObject> rememberedImport(const QString &shape)
{
    const QJsonArray all = remembered();
    for (const QJsonValue &one : all) {
        if (!shape.isEmpty() && one[shapeKey].toString() == shape) {
            return one[optionsKey].toObject();
        }
    }
    return std::nullopt;
}

void rememberImport(const QString &shape, const QJsonObject &options)
{
    if (shape.isEmpty()) {
        return;
    }
    QJsonArray all;
    all.append(QJsonObject{{shapeKey, shape}, {optionsKey, options}});
    const QJsonArray before = remembered();
    for (const QJsonValue &one : before) {
        if (one[shapeKey].toString() != shape && all.size() < mostShapes) {
            all.append(one);
        }
    }
    WriteProfileString(QString(), importsEntry, QString::fromUtf8(QJsonDocument(all).toJson(QJsonDocument::Compact)));
}

} // namespace kareport
