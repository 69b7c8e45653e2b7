#include "UnitRatios.h"

#include "Measures.h"
#include "VariableType.h"

namespace kareport
{

namespace
{

/// A unit as a multiple of metres, square metres or whole circles.
UnitRatio ratioOf(LengthUnit unit)
{
    switch (unit) {
    case LengthUnit::Metre: return {};
    case LengthUnit::Millimetre: return {{}, {1000}, 0};
    case LengthUnit::Kilometre: return {{1000}, {}, 0};
    case LengthUnit::InternationalFoot: return {{3048}, {10'000}, 0};
    case LengthUnit::UsSurveyFoot: return {{1200}, {3937}, 0};
    }
    return {};
}

UnitRatio ratioOf(AreaUnit unit)
{
    switch (unit) {
    case AreaUnit::SquareMetre: return {};
    case AreaUnit::Hectare: return {{10'000}, {}, 0};
    case AreaUnit::SquareKilometre: return {{1'000'000}, {}, 0};
    case AreaUnit::SquareFoot: return {{9'290'304}, {100'000'000}, 0};
    case AreaUnit::Acre: return {{43'560, 9'290'304}, {100'000'000}, 0};
    }
    return {};
}

UnitRatio ratioOf(AngleUnit unit)
{
    switch (unit) {
    case AngleUnit::Degree: return {{}, {360}, 0};
    case AngleUnit::Gon: return {{}, {400}, 0};
    case AngleUnit::Radian: return {{}, {2}, -1};
    }
    return {};
}

template <typename Unit>
UnitRatio between(Unit data, Unit shown)
{
    if (data == shown) {
        return {};
    }
    UnitRatio ratio = ratioOf(data);
    const UnitRatio other = ratioOf(shown);
    ratio.factors.insert(ratio.factors.end(), other.divisors.begin(), other.divisors.end());
    ratio.divisors.insert(ratio.divisors.end(), other.factors.begin(), other.factors.end());
    ratio.pi -= other.pi;
    return ratio;
}

} // namespace

UnitRatio unitRatio(int type, const DataUnits &data, const UJobSettings &shown)
{
    switch (measureOf(type)) {
    case Measure::Length: return between(data.length, shown.lengthUnit);
    case Measure::Area: return between(data.area, shown.areaUnit);
    case Measure::Angle: return type == VARIABLE_BEARING ? UnitRatio() : between(data.angle, shown.angleUnit);
    default: return {};
    }
}

} // namespace kareport
