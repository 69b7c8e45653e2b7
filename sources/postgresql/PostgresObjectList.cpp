#include "PostgresObjectList.h"

#include "PostgresRows.h"

namespace kareport
{

PostgresObjectList::PostgresObjectList(const PostgresQuery &query, const Variables &variables,
                                       const ReadProgress &progress)
    : RowObjectList(std::make_unique<PostgresRows>(query, variables, [&progress] { return progress && !progress(0); }),
                    progress)
{}

} // namespace kareport
