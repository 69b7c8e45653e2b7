#include "PostgresObjectList.h"

#include "PostgresRows.h"

namespace kareport
{

namespace
{

std::unique_ptr<RowReader> rowsOf(std::shared_ptr<PostgresConnection> &connection, const PostgresQuery &query,
                                  const Variables &variables, const ReadProgress &progress)
{
    const std::function<bool()> isToStop = [&progress] { return progress && !progress(0); };
    if (!connection || !connection->resume()) {
        connection = std::make_shared<PostgresConnection>(query.connection, isToStop);
    }
    return std::make_unique<PostgresRows>(connection, query, variables, isToStop);
}

} // namespace

PostgresObjectList::PostgresObjectList(std::shared_ptr<PostgresConnection> &connection, const PostgresQuery &query,
                                       const Variables &variables, const ReadProgress &progress)
    : RowObjectList(rowsOf(connection, query, variables, progress), progress)
{}

PostgresObjectList::PostgresObjectList(const PostgresQuery &query, const Variables &variables,
                                       const ReadProgress &progress)
    : RowObjectList(
          [&] {
              std::shared_ptr<PostgresConnection> own;
              return rowsOf(own, query, variables, progress);
          }(),
          progress)
{}

} // namespace kareport
