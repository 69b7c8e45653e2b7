#include "ImportTables.h"

#include "ColumnChoices.h"
#include "JobSettings.h"
#include "PostgresPreview.h"
#include "SqlitePreview.h"
#include "TextFolding.h"

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// What the keys of a data set of a database say in common.
struct ReadKeys
{
    QString table;
    std::vector<ColumnChoice> columns;
    DataUnits units;
};

Expected<ReadKeys> readKeys(const QJsonObject &options)
{
    const JsonSource source = JsonSource::fromObject(options);
    std::optional<InputError> error;
    const JsonNode set(source, error);
    ReadKeys keys;
    keys.table = readWholeText(set[QStringLiteral("table")]);
    keys.columns = readColumnChoices(set[QStringLiteral("columns")]);
    keys.units = readDataUnits(set[QStringLiteral("units")]);
    if (error) {
        return *error;
    }
    return keys;
}

DataPreview previewOf(const InputError &error)
{
    DataPreview preview;
    preview.error = error;
    return preview;
}

} // namespace

DataPreview previewSqliteTable(const QString &file, const QJsonObject &options,
                               const std::function<Variables(const DataUnits &)> &variablesIn, int mostRows)
{
    const auto read = readKeys(options);
    if (const InputError *error = errorOf(read)) {
        return previewOf(*error);
    }
    const auto &keys = std::get<ReadKeys>(read);
    SqliteQuery query;
    query.file = file;
    query.table = keys.table;
    query.columns = keys.columns;
    return previewSqlite(query, variablesIn(keys.units), mostRows);
}

DataPreview previewPostgresTable(const PostgresSample &sample, const QJsonObject &options,
                                 const std::function<Variables(const DataUnits &)> &variablesIn)
{
    const auto read = readKeys(options);
    if (const InputError *error = errorOf(read)) {
        return previewOf(*error);
    }
    const auto &keys = std::get<ReadKeys>(read);
    return previewPostgres(sample, keys.columns, variablesIn(keys.units));
}

QJsonObject proposedGeometry(const DataPreview &own, const Variables &variables)
{
    constexpr std::pair<const char *, const char *> parts[] = {
        {"Northing", "@y"}, {"Easting", "@x"}, {"Elevation", "@z"}};
    const auto has = [&own](const QString &name) {
        return std::any_of(own.columns.begin(), own.columns.end(),
                           [&name](const PreviewedColumn &column) { return equalFolded(column.name, name); });
    };
    QJsonObject proposed;
    for (const auto &[variable, part] : parts) {
        const QString name = QLatin1StringView(variable);
        if (has(QLatin1StringView(part)) && !has(name) && variables.find(name)) {
            proposed.insert(name, QLatin1StringView(part));
        }
    }
    return proposed;
}

} // namespace kareport
