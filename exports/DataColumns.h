#pragma once

#include "ResultOptions.h"
#include "ResultSink.h"

#include <cstddef>
#include <vector>

namespace kareport
{

/// The columns of a table that a file of data has, by their places in the table: those of variables, each once, so that the
/// file can be read as data again. With the values of the data, sort keys that the report does not show are among them:
/// without these the rows would be sorted in another way.
std::vector<std::size_t> dataColumns(const ResultTable &table, ResultValues values);

} // namespace kareport
