#pragma once

#include "ColumnBinding.h"
#include "RowObjectList.h"

#include <QString>

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

class PostgresConnection;

/// What is read from a PostgreSQL database: what a query answers.
struct PostgresQuery
{
    QString connection; ///< such as "service=survey" or "host=... dbname=..."; never with a password
    QString query;      ///< one SELECT
    std::vector<std::optional<QString>>
        parameters; ///< values of $1, $2, ...; nothing is NULL. They go beside the query
    std::vector<ColumnChoice> columns;
};

/// The rows of a PostgreSQL database as data objects.
///
/// They come one by one, in a transaction that only reads and sees one state of the database; NULL is a missing value. A password
/// comes from the user's own password file or environment. Where a column holds PostGIS geometries, or is the only one of
/// bytes, there are the columns @x, @y and @z of its points, @srs, their reference system as "EPSG:25832", and @srsName,
/// its name: variables are read from them where they are chosen.
class PostgresObjectList : public RowObjectList
{
public:
    /// Connects and finds the columns; that may take a while, so `progress` is asked meanwhile.
    PostgresObjectList(const PostgresQuery &query, const Variables &variables, const ReadProgress &progress);
    /// The same on a connection that may serve other lists, one at a time, which then are of one state of the database.
    /// @param connection  is made where there is none yet, or where it can no longer be used
    PostgresObjectList(std::shared_ptr<PostgresConnection> &connection, const PostgresQuery &query,
                       const Variables &variables, const ReadProgress &progress);
};

} // namespace kareport
