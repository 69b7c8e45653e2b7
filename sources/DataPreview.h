#pragma once

#include "InputError.h"

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// A cell of the first rows of a data set, and whether it can be read.
struct PreviewedCell
{
    QString text;
    QString wrong = {}; ///< why it does not fit what is read from its column; empty where it does, or is not read
};

/// A column of a data set.
struct PreviewedColumn
{
    QString name;     ///< empty where columns have none
    QString variable; ///< that is read from it; empty for none
};

/// How the first rows of a data set are read, for a user who chooses how they are to be.
struct DataPreview
{
    std::vector<PreviewedColumn> columns = {};
    std::vector<std::vector<PreviewedCell>> rows = {}; ///< a row that is wrong may have another number of cells
    std::optional<InputError> error = std::nullopt;    ///< the first thing that is wrong, as reading the data says it
};

} // namespace kareport
