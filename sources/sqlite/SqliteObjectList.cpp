#include "SqliteObjectList.h"

#include "SqliteRows.h"

namespace kareport
{

namespace
{

/// A file that a list before has stopped is read again.
std::shared_ptr<SqliteFile> resumed(std::shared_ptr<SqliteFile> file)
{
    file->resume();
    return file;
}

} // namespace

SqliteObjectList::SqliteObjectList(std::shared_ptr<SqliteFile> file, const SqliteQuery &query,
                                   const Variables &variables, ReadProgress progress)
    : RowObjectList(std::make_unique<SqliteRows>(resumed(std::move(file)), query, variables), std::move(progress))
{}

SqliteObjectList::SqliteObjectList(const SqliteQuery &query, const Variables &variables, ReadProgress progress)
    : SqliteObjectList(openFile(query.file), query, variables, std::move(progress))
{}

std::shared_ptr<SqliteFile> SqliteObjectList::openFile(const QString &path)
{
    return std::make_shared<SqliteFile>(path);
}

} // namespace kareport
