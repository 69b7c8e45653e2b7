#pragma once

#include "ColumnBinding.h"
#include "JsonNode.h"
#include "RowObjectList.h"

#include <memory>
#include <vector>

namespace kareport
{

struct DataRequest;

/// Reads an object that maps variables to the columns that they are read from: names, or numbers from 1. What is wrong
/// with one fails its node.
std::vector<ColumnChoice> readColumnChoices(const JsonNode &node);

/// Reads a text that a database is given. A zero character, which would end it there, fails the node.
QString readWholeText(const JsonNode &node);

/// Rows that have been made, or what is wrong with their columns or with the first of them. What a job chose wrongly has the
/// place of the choice in the job.
Expected<std::unique_ptr<RowList>> openedRows(std::unique_ptr<RowObjectList> rows, const DataRequest &request);

} // namespace kareport
