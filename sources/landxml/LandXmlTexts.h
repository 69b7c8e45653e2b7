#pragma once

#include "UJobSettings.h"

#include <QString>

#include <optional>

namespace kareport
{

/// A length, a coordinate, a height or a station as a report shows it, for a dictionary that has the variable as a text: INF where
/// it is infinite. Nothing for values of other types.
/// @param metres  the value
/// @param type    the value type of the variable
std::optional<QString> landXmlText(double metres, int type, const UJobSettings &settings);

} // namespace kareport
