#pragma once

#include "CellDecimal.h"

#include <optional>

namespace kareport
{

/// Angles that are directions: a whole turn more is the same one.
struct Turn
{
    CellDecimal counted; ///< a whole turn as readers count it; 0 where no decimal number says it
    double internal = 0; ///< the same in radians
};

/// By how much one value is greater than another one, as their reader counts: decimally, without the error of subtracting what
/// is not. Of values that are not finite, as they are subtracted.
/// @param reader  of both, which are internal
/// @param turn    of directions, whose difference is at most half a turn either way; nothing for other values
double countedDifference(CellReader &reader, double left, double right, const std::optional<Turn> &turn = std::nullopt);

/// A direction from 0 to below a whole turn.
double wrapped(double internal, const Turn &turn);

} // namespace kareport
