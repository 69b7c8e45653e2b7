#include "DataUnits.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <numbers>

namespace
{

using kareport::AngleUnit;
using kareport::AreaUnit;
using kareport::DataUnits;
using kareport::LengthUnit;

constexpr int lengthTypes[] = {5, 6, 7, 8, 9, 10}; // COORDINATE, LENGTH, DISTANCE, ELEVATION, STATION, OFFSET
constexpr int areaTypes[] = {11};                  // AREA
constexpr int angleTypes[] = {3, 4, 18};           // ANGLE, BEARING, VANGLE

template <std::size_t count>
bool isOneOf(const int (&types)[count], int type)
{
    return std::find(std::begin(types), std::end(types), type) != std::end(types);
}

TEST(DataUnits, AreMetresSquareMetresAndDegreesUnlessSaid)
{
    for (int type = -1; type <= 25; ++type) {
        const double expected = isOneOf(angleTypes, type) ? std::numbers::pi / 180 : 1;
        EXPECT_EQ(DataUnits().factorOf(type), expected) << "type " << type;
    }
    EXPECT_FALSE(DataUnits().sexagesimal);
}

TEST(DataUnits, LengthsAreMultipliedIntoMetres)
{
    struct Row
    {
        LengthUnit unit;
        double factor;
        const char *reason;
    };
    constexpr Row rows[] = {
        {LengthUnit::Metre, 1, "m"},
        {LengthUnit::Millimetre, 0.001, "mm"},
        {LengthUnit::Kilometre, 1000, "km"},
        {LengthUnit::InternationalFoot, 0.3048, "ft"},
        {LengthUnit::UsSurveyFoot, 1200.0 / 3937.0, "usft"},
    };
    for (const Row &row : rows) {
        DataUnits units;
        units.length = row.unit;
        for (int type = -1; type <= 25; ++type) {
            const double expected = isOneOf(lengthTypes, type) ? row.factor : DataUnits().factorOf(type);
            EXPECT_EQ(units.factorOf(type), expected) << row.reason << ", type " << type;
        }
    }
}

TEST(DataUnits, AreasAreMultipliedIntoSquareMetres)
{
    struct Row
    {
        AreaUnit unit;
        double factor;
        const char *reason;
    };
    constexpr Row rows[] = {
        {AreaUnit::SquareMetre, 1, "m2"},        {AreaUnit::Hectare, 10000, "ha"},
        {AreaUnit::SquareKilometre, 1e6, "km2"}, {AreaUnit::SquareFoot, 0.09290304, "ft2"},
        {AreaUnit::Acre, 4046.8564224, "ac"},
    };
    for (const Row &row : rows) {
        DataUnits units;
        units.area = row.unit;
        for (int type = -1; type <= 25; ++type) {
            const double expected = isOneOf(areaTypes, type) ? row.factor : DataUnits().factorOf(type);
            EXPECT_EQ(units.factorOf(type), expected) << row.reason << ", type " << type;
        }
    }
}

TEST(DataUnits, AnglesAreMultipliedIntoRadians)
{
    struct Row
    {
        AngleUnit unit;
        bool sexagesimal;
        double factor;
        const char *reason;
    };
    constexpr Row rows[] = {
        {AngleUnit::Degree, false, std::numbers::pi / 180, "deg"},
        {AngleUnit::Gon, false, std::numbers::pi / 200, "gon"},
        {AngleUnit::Radian, false, 1, "rad"},
        {AngleUnit::Degree, true, std::numbers::pi / 180, "dms"},
    };
    for (const Row &row : rows) {
        DataUnits units;
        units.angle = row.unit;
        units.sexagesimal = row.sexagesimal;
        for (int type = -1; type <= 25; ++type) {
            const double expected = isOneOf(angleTypes, type) ? row.factor : 1;
            EXPECT_EQ(units.factorOf(type), expected) << row.reason << ", type " << type;
        }
    }
}

} // namespace
