#pragma once

#include "ColumnBinding.h"
#include "FileBytes.h"
#include "RowObjectList.h"

#include <memory>
#include <vector>

namespace kareport
{

/// The rows of a JSON file as data objects: a list of objects, or one object a line, in UTF-8. Each object is read when it is
/// asked for.
///
/// The keys of the objects are the columns. They show while the rows are read: `reader().columns()` is complete after the
/// last row. null is a missing value, and so is a key that an object does not have.
class JsonFileList : public RowObjectList
{
public:
    /// @param columns  which key a variable is read from, where that is not its name; numbers of columns are an error
    JsonFileList(std::shared_ptr<const FileBytes> file, const std::vector<ColumnChoice> &columns,
                 const Variables &variables, ReadProgress progress);
};

} // namespace kareport
