#include "JsonFileList.h"

#include "JsonFileRows.h"

namespace kareport
{

JsonFileList::JsonFileList(std::shared_ptr<const FileBytes> file, const std::vector<ColumnChoice> &columns,
                           const Variables &variables, ReadProgress progress)
    : RowObjectList(std::make_unique<JsonFileRows>(std::move(file), columns, variables), std::move(progress))
{}

} // namespace kareport
