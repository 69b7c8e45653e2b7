#pragma once

#include "DataUnits.h"
#include "ExactDecimal.h"
#include "UJobSettings.h"

namespace kareport
{

/// What a number of the data is multiplied by to be in the unit that values of its type are shown in.
UnitRatio unitRatio(int type, const DataUnits &data, const UJobSettings &shown);

} // namespace kareport
