#include "ReportRecipe.h"

#include <QJsonArray>
#include <QJsonDocument>

namespace kareport
{

namespace
{

QString jsonOf(const QJsonValue &value)
{
    const QByteArray list = QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact);
    return QString::fromUtf8(list.sliced(1, list.size() - 2));
}

} // namespace

QString ReportRecipe::jobFile() const
{
    const auto *file = std::get_if<QString>(&origin);
    return file != nullptr ? *file : QString();
}

Expected<JsonSource> sourceOf(const ReportRecipe &recipe)
{
    const auto *file = std::get_if<QString>(&recipe.origin);
    auto read = file != nullptr
                    ? JsonSource::read(*file)
                    : Expected<JsonSource>(JsonSource::fromObject(std::get<TemplateJob>(recipe.origin).toJson()));
    if (auto *source = std::get_if<JsonSource>(&read)) {
        for (auto setting = recipe.settings.begin(); setting != recipe.settings.end(); ++setting) {
            // A job whose settings are not an object has no place for one, which reading it says.
            source->set(QStringLiteral("settings.") + setting.key(), jsonOf(setting.value()));
        }
    }
    return read;
}

} // namespace kareport
