#pragma once

#include "TableGroups.h"
#include "TableShape.h"
#include "VariableLookup.h"

#include <functional>
#include <vector>

namespace kareport
{

/// Gives a total of a variable its index in the totals of the table.
using TotalIndex = std::function<TotalCell(TotalKind kind, const TableShape::Name &variable)>;

/// Reads a text with placeholders: "{count}", a total such as "{sum:Volume}", a unit such as "{areaUnit}", or a variable that
/// groups are made by. "{{" is one "{".
/// @param by  the variables of the group and of those around it; none for totals of a page or of the table
GroupText readGroupText(const TableShape::Name &text, const std::vector<FoundVariable> &by, const TotalIndex &indexOf,
                        VariableLookup &lookup);

} // namespace kareport
