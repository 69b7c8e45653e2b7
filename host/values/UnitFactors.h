#pragma once

#include "KaReportExport.h"

#include <QStringView>

#include <numbers>
#include <optional>

namespace kareport
{

enum class LengthUnit
{
    Metre,
    Millimetre,
    Kilometre,
    InternationalFoot,
    UsSurveyFoot
};

enum class AreaUnit
{
    SquareMetre,
    Hectare,
    SquareKilometre,
    SquareFoot,
    Acre
};

enum class AngleUnit
{
    Degree,
    Gon,
    Radian
};

/// Metres in one unit of length.
KAREPORT_EXPORT double metresIn(LengthUnit unit);
/// Square metres in one unit of area.
KAREPORT_EXPORT double squareMetresIn(AreaUnit unit);
/// How many of the unit one radian is.
KAREPORT_EXPORT double perRadian(AngleUnit unit);
/// The symbol that is shown behind a length; both feet show "ft".
KAREPORT_EXPORT QStringView symbolOf(LengthUnit unit);

/// The unit of a settings key such as "usft", "ha" or "gon"; nothing for any other text. Case matters.
KAREPORT_EXPORT std::optional<LengthUnit> lengthUnitFromKey(QStringView key);
KAREPORT_EXPORT std::optional<AreaUnit> areaUnitFromKey(QStringView key);
KAREPORT_EXPORT std::optional<AngleUnit> angleUnitFromKey(QStringView key);
/// The settings key of a unit.
KAREPORT_EXPORT QStringView keyOf(LengthUnit unit);
KAREPORT_EXPORT QStringView keyOf(AreaUnit unit);
KAREPORT_EXPORT QStringView keyOf(AngleUnit unit);

} // namespace kareport
