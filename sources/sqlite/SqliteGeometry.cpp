#include "SqliteGeometry.h"

#include <algorithm>

namespace kareport
{

SqliteGeometry::SqliteGeometry(SqliteFile &file)
{
    const SqliteStatement columns =
        file.prepare(QStringLiteral("SELECT table_name, column_name FROM gpkg_geometry_columns"));
    while (columns && sqlite3_step(columns.get()) == SQLITE_ROW) {
        columns_.emplace_back(textOfColumn(columns.get(), 0), textOfColumn(columns.get(), 1));
    }
    const SqliteStatement systems = file.prepare(
        QStringLiteral("SELECT srs_id, organization, organization_coordsys_id, srs_name FROM gpkg_spatial_ref_sys"));
    while (systems && sqlite3_step(systems.get()) == SQLITE_ROW) {
        systems_.insert(
            sqlite3_column_int(systems.get(), 0),
            {textOfColumn(systems.get(), 1) + u':' + textOfColumn(systems.get(), 2), textOfColumn(systems.get(), 3)});
    }
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
