#pragma once

#include "Units.h"

#include <QStringView>

#include <optional>

namespace kareport
{

/// Metres in one unit of length.
double metresIn(LengthUnit unit);
/// Square metres in one unit of area.
double squareMetresIn(AreaUnit unit);
/// How many of the unit one radian is.
double perRadian(AngleUnit unit);
/// The symbol that is shown after a length; both feet show "ft".
QStringView symbolOf(LengthUnit unit);
/// What a text that speaks of a unit calls it: "US ft" and "ft" are told apart there.
QStringView nameOf(LengthUnit unit);
QStringView nameOf(AreaUnit unit);
QStringView nameOf(AngleUnit unit);

/// The unit of a settings key such as "usft", "ha" or "gon"; nothing for any other text. Case matters.
std::optional<LengthUnit> lengthUnitFromKey(QStringView key);
std::optional<AreaUnit> areaUnitFromKey(QStringView key);
std::optional<AngleUnit> angleUnitFromKey(QStringView key);
/// The settings key of a unit.
QStringView keyOf(LengthUnit unit);
QStringView keyOf(AreaUnit unit);
QStringView keyOf(AngleUnit unit);

} // namespace kareport
