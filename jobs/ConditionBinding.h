#pragma once

#include "RowConditions.h"
#include "TableShape.h"
#include "VariableLookup.h"

namespace kareport
{

/// Looks up what a condition names. What is wrong is an error of the lookup; what comes back then is not used.
RowCondition bindCondition(const TableShape::Condition &condition, VariableLookup &lookup);

} // namespace kareport
