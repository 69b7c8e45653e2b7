#include "SqliteObjectList.h"

#include "SqliteRows.h"

namespace kareport
{

SqliteObjectList::SqliteObjectList(const SqliteQuery &query, const Variables &variables, ReadProgress progress)
    : RowObjectList(std::make_unique<SqliteRows>(query, variables), std::move(progress))
{}

} // namespace kareport
