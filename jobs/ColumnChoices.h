#pragma once

#include "ColumnBinding.h"
#include "JsonNode.h"
#include "RowObjectList.h"

#include <vector>

namespace kareport
{

struct DataRequest;

/// Reads an object that maps variables to the columns that they are read from: names, or numbers from 1. What is wrong
/// with one fails its node.
std::vector<ColumnChoice> readColumnChoices(const JsonNode &node);

/// What is wrong with the columns or the first rows of a list that has been made. What a job chose wrongly has the place
/// of the choice in the job; nothing when the rows can be read.
std::optional<InputError> whyNotOpened(const RowObjectList &rows, const DataRequest &request);

} // namespace kareport
