#pragma once

#include "ColumnBinding.h"
#include "RowObjectList.h"

#include <QString>

#include <memory>
#include <vector>

namespace kareport
{

class SqliteFile;

/// What is read from a SQLite database, a GeoPackage among them: all rows of a table or a view, or what a query answers.
struct SqliteQuery
{
    QString file;
    QString table; ///< empty for a query
    QString query; ///< one SELECT
    std::vector<ColumnChoice> columns;
};

/// The rows of a SQLite database as data objects.
///
/// The database is opened for reading only and all rows are of one state of it; NULL is a missing value. Where a column holds the
/// geometries of a GeoPackage there are the columns @x, @y and @z of its points, @srs, their reference system as
/// "EPSG:25832", and @srsName, its name: variables are read from them where they are chosen.
class SqliteObjectList : public RowObjectList
{
public:
    /// Finds the columns. @param file  the database of the query, opened for reading. Lists of one file are of one state, and
    ///              one of them exists at a time
    SqliteObjectList(std::shared_ptr<SqliteFile> file, const SqliteQuery &query, const Variables &variables,
                     ReadProgress progress);
    /// The same with a database that is opened for this list alone.
    SqliteObjectList(const SqliteQuery &query, const Variables &variables, ReadProgress progress);

    /// Opens a database. What is wrong with it makes the list fail.
    static std::shared_ptr<SqliteFile> openFile(const QString &path);
};

} // namespace kareport
