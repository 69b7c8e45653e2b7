#pragma once

#include "ColumnBinding.h"
#include "LibPq.h"
#include "UDataObject.h"

#include <optional>
#include <string_view>
#include <vector>

namespace kareport
{

class PostgresConnection;

/// The columns of what a query answers.
struct PostgresColumns
{
    std::vector<SourceColumn> columns; ///< those of the answer, and then those of its geometry
    std::size_t own = 0;               ///< how many the answer has
    std::optional<int> geometry;       ///< the column of the answer that has points
    std::vector<Oid> types;            ///< of the columns of the answer
};

/// Finds the columns of a query. Two columns of geometries are an error.
/// @param description  of the query that was prepared last on the connection
Expected<PostgresColumns> findPostgresColumns(PostgresConnection &connection, const PGresult *description);

/// Whether a type is that of bytes.
bool isBytes(Oid type);

/// Stores the value of a cell that is not NULL and not empty.
/// @param text  as the server sends it
/// @return what is wrong; nothing when it is stored
std::optional<QString> storePostgresCell(const BoundField &field, std::string_view text, Oid type, UDataObject &object);

} // namespace kareport
