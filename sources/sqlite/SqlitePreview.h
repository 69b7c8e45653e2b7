#pragma once

#include "DataPreview.h"
#include "SqliteObjectList.h"

#include <QString>
#include <QStringList>

#include <string_view>

namespace kareport
{

/// Whether the bytes of a file are those of a SQLite database, a GeoPackage among them.
bool isSqlite(std::string_view bytes);

/// The names of the tables and views of a database.
Expected<QStringList> sqliteTables(const QString &file);

/// Reads the first rows of a table or a query as `SqliteObjectList` does. Of a geometry the parts are columns, whose values are not
/// shown.
DataPreview previewSqlite(const SqliteQuery &query, const Variables &variables, int mostRows);

} // namespace kareport
