#pragma once

#include "UJobSettings.h"

#include <QString>

#include <optional>

namespace kareport
{

/// A value with a unit as a report shows it, for a dictionary that has the variable as a text: INF where it is infinite. An offset
/// has L or R after it; areas and angles have the decimals of plain numbers. Nothing for values of other types, which have no unit.
/// @param value  in metres, square metres or radians
/// @param type   the value type of the variable
std::optional<QString> landXmlText(double value, int type, const UJobSettings &settings);

} // namespace kareport
