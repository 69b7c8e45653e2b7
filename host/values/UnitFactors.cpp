#include "UnitFactors.h"

#include <array>

namespace kareport
{

namespace
{

struct LengthRow
{
    LengthUnit unit;
    QStringView key;
    double metres;
    QStringView symbol;
    QStringView name;
};

constexpr std::array<LengthRow, 5> lengths = {{
    {LengthUnit::Metre, u"m", 1.0, u"m", u"m"},
    {LengthUnit::Millimetre, u"mm", 0.001, u"mm", u"mm"},
    {LengthUnit::Kilometre, u"km", 1000.0, u"km", u"km"},
    {LengthUnit::InternationalFoot, u"ft", 0.3048, u"ft", u"ft"},
    {LengthUnit::UsSurveyFoot, u"usft", 1200.0 / 3937.0, u"ft", u"US ft"},
}};

struct AreaRow
{
    AreaUnit unit;
    QStringView key;
    double squareMetres;
    QStringView name;
};

constexpr std::array<AreaRow, 5> areas = {{
    {AreaUnit::SquareMetre, u"m2", 1.0, u"m²"},
    {AreaUnit::Hectare, u"ha", 10000.0, u"ha"},
    {AreaUnit::SquareKilometre, u"km2", 1000000.0, u"km²"},
    {AreaUnit::SquareFoot, u"ft2", 0.09290304, u"ft²"},
    {AreaUnit::Acre, u"ac", 4046.8564224, u"ac"},
}};

struct AngleRow
{
    AngleUnit unit;
    QStringView key;
    double perRadian;
    QStringView name;
};

constexpr std::array<AngleRow, 3> angles = {{
    {AngleUnit::Degree, u"deg", 180.0 / std::numbers::pi, u"°"},
    {AngleUnit::Gon, u"gon", 200.0 / std::numbers::pi, u"gon"},
    {AngleUnit::Radian, u"rad", 1.0, u"rad"},
}};

/// Whether each row is at the place of its unit, where it is looked up.
template <typename Rows>
constexpr bool areInOrder(const Rows &rows)
{
    for (std::size_t i = 0; i < rows.size(); ++i) {
        if (static_cast<std::size_t>(rows[i].unit) != i) {
            return false;
        }
    }
    return true;
}
static_assert(areInOrder(lengths) && areInOrder(areas) && areInOrder(angles));

template <typename Unit, typename Rows>
const typename Rows::value_type &rowOf(const Rows &rows, Unit unit)
{
    return rows[static_cast<std::size_t>(unit)];
}

template <typename Unit, typename Rows>
std::optional<Unit> unitFromKey(const Rows &rows, QStringView key)
{
    for (std::size_t i = 0; i < rows.size(); ++i) {
        if (rows[i].key == key) {
            return rows[i].unit;
        }
    }
    return std::nullopt;
}

} // namespace

double metresIn(LengthUnit unit)
{
    return rowOf(lengths, unit).metres;
}

double squareMetresIn(AreaUnit unit)
{
    return rowOf(areas, unit).squareMetres;
}

double perRadian(AngleUnit unit)
{
    return rowOf(angles, unit).perRadian;
}

QStringView symbolOf(LengthUnit unit)
{
    return rowOf(lengths, unit).symbol;
}

QStringView nameOf(LengthUnit unit)
{
    return rowOf(lengths, unit).name;
}

QStringView nameOf(AreaUnit unit)
{
    return rowOf(areas, unit).name;
}

QStringView nameOf(AngleUnit unit)
{
    return rowOf(angles, unit).name;
}

std::optional<LengthUnit> lengthUnitFromKey(QStringView key)
{
    return unitFromKey<LengthUnit>(lengths, key);
}

std::optional<AreaUnit> areaUnitFromKey(QStringView key)
{
    return unitFromKey<AreaUnit>(areas, key);
}

std::optional<AngleUnit> angleUnitFromKey(QStringView key)
{
    return unitFromKey<AngleUnit>(angles, key);
}

QStringView keyOf(LengthUnit unit)
{
    return rowOf(lengths, unit).key;
}

QStringView keyOf(AreaUnit unit)
{
    return rowOf(areas, unit).key;
}

QStringView keyOf(AngleUnit unit)
{
    return rowOf(angles, unit).key;
}

} // namespace kareport
