#include "SqliteGeometry.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// Reads the rows of a table that a GeoPackage has. @return what is wrong with it; a database without the table is none
std::optional<InputError> readTable(SqliteFile &file, const QString &table, const QString &columns,
                                    const std::function<void(sqlite3_stmt *)> &takeRow)
{
    const SqliteStatement statement = file.prepare(QStringLiteral("SELECT %1 FROM %2").arg(columns, table));
    if (!statement) {
        const InputError wrong = file.failure(file.lastCode());
        return file.has(table) ? std::optional(wrong) : std::nullopt;
    }
    int code = SQLITE_ROW;
    while (code == SQLITE_ROW) {
        code = sqlite3_step(statement.get());
        if (code == SQLITE_ROW) {
            takeRow(statement.get());
        }
    }
    return code == SQLITE_DONE || code == SQLITE_INTERRUPT ? std::nullopt : std::optional(file.failure(code));
}

} // namespace

SqliteGeometry::SqliteGeometry(SqliteFile &file)
{
    if (file.error()) {
        return;
    }
    error_ =
        readTable(file, QStringLiteral("gpkg_geometry_columns"), QStringLiteral("table_name, column_name"),
                  [this](sqlite3_stmt *row) { columns_.emplace_back(textOfColumn(row, 0), textOfColumn(row, 1)); });
    systemsError_ = readTable(
        file, QStringLiteral("gpkg_spatial_ref_sys"),
        QStringLiteral("srs_id, organization, organization_coordsys_id, srs_name"), [this](sqlite3_stmt *row) {
            systems_.insert(sqlite3_column_int(row, 0),
                            {textOfColumn(row, 1) + u':' + textOfColumn(row, 2), textOfColumn(row, 3)});
        });
}

bool SqliteGeometry::isGeometry(const QString &table, const QString &column) const
{
    return std::any_of(columns_.begin(), columns_.end(), [&](const auto &known) {
        return known.first.compare(table, Qt::CaseInsensitive) == 0 &&
               known.second.compare(column, Qt::CaseInsensitive) == 0;
    });
}

const ReferenceSystem *SqliteGeometry::referenceSystem(qint32 number) const
{
    const auto found = systems_.constFind(number);
    return found != systems_.constEnd() ? &*found : nullptr;
}

} // namespace kareport
