#include "TemplateJob.h"

#include <QJsonArray>

namespace kareport
{

QJsonObject TemplateJob::toJson() const
{
    const QString set = QStringLiteral("data");
    const bool isTable = !table.isEmpty();
    const QJsonObject step = {{isTable ? QStringLiteral("table") : QStringLiteral("block"), isTable ? table : block},
                              {set, set}};
    return {
        {QStringLiteral("template"),
         QJsonObject{{QStringLiteral("file"), templateFile}, {QStringLiteral("name"), templateName}}},
        {set, QJsonObject{{set, QJsonObject{{QStringLiteral("csv"), data}}}}},
        {QStringLiteral("report"), QJsonArray{step}},
    };
}

} // namespace kareport
