#include "UnitFactors.h"

#include <array>

namespace kareport
{

namespace
{

struct LengthRow
{
    QStringView key;
    double metres;
    QStringView symbol;
};

constexpr std::array<LengthRow, 5> lengths = {{
    {u"m", 1.0, u"m"},
    {u"mm", 0.001, u"mm"},
    {u"km", 1000.0, u"km"},
    {u"ft", 0.3048, u"ft"},
    {u"usft", 1200.0 / 3937.0, u"ft"},
}};

struct AreaRow
{
    QStringView key;
    double squareMetres;
};

constexpr std::array<AreaRow, 5> areas = {{
    {u"m2", 1.0},
    {u"ha", 10000.0},
    {u"km2", 1000000.0},
    {u"ft2", 0.09290304},
    {u"ac", 4046.8564224},
}};

struct AngleRow
{
    QStringView key;
    double perRadian;
};

constexpr std::array<AngleRow, 3> angles = {{
    {u"deg", 180.0 / std::numbers::pi},
    {u"gon", 200.0 / std::numbers::pi},
    {u"rad", 1.0},
}};

// The rows stand in the order of the enumerators.
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
            return static_cast<Unit>(i);
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
