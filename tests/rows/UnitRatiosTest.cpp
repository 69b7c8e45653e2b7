#include "UnitRatios.h"

#include "VariableType.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(UnitRatios, LeadFromTheDataToWhatIsShown)
{
    const struct
    {
        int type;
        const char *data;
        const char *shown;
        const char *one; ///< 1 of the data, with 12 decimals
    } rows[] = {
        {VARIABLE_LENGTH, "m", "m", "1.000000000000"},
        {VARIABLE_LENGTH, "ft", "m", "0.304800000000"},
        {VARIABLE_STATION, "m", "ft", "3.280839895013"},
        {VARIABLE_OFFSET, "m", "usft", "3.280833333333"},
        {VARIABLE_LENGTH, "usft", "ft", "1.000002000004"},
        {VARIABLE_LENGTH, "mm", "km", "0.000001000000"},
        {VARIABLE_ELEVATION, "km", "mm", "1000000.000000000000"},
        {VARIABLE_AREA, "ha", "ac", "2.471053814672"},
        {VARIABLE_AREA, "ac", "ft2", "43560.000000000000"},
        {VARIABLE_AREA, "km2", "m2", "1000000.000000000000"},
        {VARIABLE_ANGLE, "deg", "gon", "1.111111111111"},
        {VARIABLE_VANGLE, "gon", "deg", "0.900000000000"},
        {VARIABLE_ANGLE, "rad", "deg", "57.295779513082"},
        {VARIABLE_ANGLE, "deg", "rad", "0.017453292520"},
        {VARIABLE_ANGLE, "gon", "rad", "0.015707963268"},
        {VARIABLE_ANGLE, "rad", "rad", "1.000000000000"},
        {VARIABLE_DOUBLE, "ft", "m", "1.000000000000"},
        {VARIABLE_INTEGER, "ft", "m", "1.000000000000"},
    };
    for (const auto &row : rows) {
        DataUnits data;
        UJobSettings shown;
        const auto key = [](const char *text) { return QString::fromLatin1(text); };
        data.length = lengthUnitFromKey(key(row.data)).value_or(LengthUnit::Metre);
        data.area = areaUnitFromKey(key(row.data)).value_or(AreaUnit::SquareMetre);
        data.angle = angleUnitFromKey(key(row.data)).value_or(AngleUnit::Degree);
        shown.lengthUnit = lengthUnitFromKey(key(row.shown)).value_or(LengthUnit::Metre);
        shown.areaUnit = areaUnitFromKey(key(row.shown)).value_or(AreaUnit::SquareMetre);
        shown.angleUnit = angleUnitFromKey(key(row.shown)).value_or(AngleUnit::Degree);
        const ExactDecimal one(false, Natural(1), 0);
        EXPECT_EQ(one.rounded(unitRatio(row.type, data, shown), 1, 12).digits, row.one) << row.data << ' ' << row.shown;
    }
}

} // namespace
