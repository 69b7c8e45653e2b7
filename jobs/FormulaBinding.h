#pragma once

#include "RowFormulas.h"
#include "TableShape.h"
#include "VariableLookup.h"

#include <QString>

#include <optional>

namespace kareport
{

/// Looks up what a formula names. @param result  the variable that is set
/// @return nothing where something is wrong, which is an error of the lookup
std::optional<RowFormula> bindFormula(const TableShape::Formula &formula, const FoundVariable &result,
                                      VariableLookup &lookup);

/// What is wrong with a variable that does not measure what it is to be set to.
QString noFit(const FoundVariable &target);

} // namespace kareport
