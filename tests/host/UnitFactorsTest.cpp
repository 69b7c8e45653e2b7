#include "UnitFactors.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(UnitFactors, OfLengths)
{
    struct Row
    {
        LengthUnit unit;
        QStringView key;
        double metres;
        QStringView symbol;
        const char *reason;
    };
    constexpr Row rows[] = {
        {LengthUnit::Metre, u"m", 1.0, u"m", "the internal unit"},
        {LengthUnit::Millimetre, u"mm", 0.001, u"mm", "a thousandth"},
        {LengthUnit::Kilometre, u"km", 1000.0, u"km", "a thousand"},
        {LengthUnit::InternationalFoot, u"ft", 0.3048, u"ft", "exact by definition"},
        {LengthUnit::UsSurveyFoot, u"usft", 1200.0 / 3937.0, u"ft", "39.37 inches a metre; shown like the other foot"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(metresIn(row.unit), row.metres) << row.reason;
        EXPECT_EQ(symbolOf(row.unit), row.symbol) << row.reason;
        EXPECT_EQ(lengthUnitFromKey(row.key), row.unit) << row.reason;
    }
}

TEST(UnitFactors, OfAreas)
{
    struct Row
    {
        AreaUnit unit;
        QStringView key;
        double squareMetres;
        const char *reason;
    };
    constexpr Row rows[] = {
        {AreaUnit::SquareMetre, u"m2", 1.0, "the internal unit"},
        {AreaUnit::Hectare, u"ha", 10000.0, "100 m by 100 m"},
        {AreaUnit::SquareKilometre, u"km2", 1000000.0, "1000 m by 1000 m"},
        {AreaUnit::SquareFoot, u"ft2", 0.09290304, "0.3048 squared, written out"},
        {AreaUnit::Acre, u"ac", 4046.8564224, "43560 square feet, written out"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(squareMetresIn(row.unit), row.squareMetres) << row.reason;
        EXPECT_EQ(areaUnitFromKey(row.key), row.unit) << row.reason;
    }
}

TEST(UnitFactors, OfAngles)
{
    struct Row
    {
        AngleUnit unit;
        QStringView key;
        double perRadian;
        const char *reason;
    };
    constexpr Row rows[] = {
        {AngleUnit::Degree, u"deg", 57.29577951308232, "180 / pi, rounded once"},
        {AngleUnit::Gon, u"gon", 63.66197723675813, "200 / pi, rounded once"},
        {AngleUnit::Radian, u"rad", 1.0, "the internal unit"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(perRadian(row.unit), row.perRadian) << row.reason;
        EXPECT_EQ(angleUnitFromKey(row.key), row.unit) << row.reason;
    }
}

TEST(UnitFactors, AKeyOfNoUnitGivesNothing)
{
    struct Row
    {
        QStringView key;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", "empty"},
        {{}, "null"},
        {u"M", "case matters"},
        {u"M2", "case matters"},
        {u"DEG", "case matters"},
        {u" m", "blanks matter"},
        {u"m ", "blanks matter"},
        {u"k", "cut off in the middle"},
        {u"usf", "cut off in the middle"},
        {u"mmm", "begins with a key"},
        {u"degrees", "begins with a key"},
        {u"yd", "a unit that is not offered"},
        {u"ｍ", "a full-width letter is another one"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(lengthUnitFromKey(row.key), std::nullopt) << row.reason;
        EXPECT_EQ(areaUnitFromKey(row.key), std::nullopt) << row.reason;
        EXPECT_EQ(angleUnitFromKey(row.key), std::nullopt) << row.reason;
    }
    EXPECT_EQ(lengthUnitFromKey(u"m2"), std::nullopt) << "an area is not a length";
    EXPECT_EQ(lengthUnitFromKey(u"deg"), std::nullopt) << "an angle is not a length";
    EXPECT_EQ(areaUnitFromKey(u"m"), std::nullopt) << "a length is not an area";
    EXPECT_EQ(angleUnitFromKey(u"dms"), std::nullopt) << "only bearings are shown so";
}

TEST(UnitFactors, TheFeetAreToldApartInTexts)
{
    EXPECT_EQ(nameOf(LengthUnit::InternationalFoot), u"ft");
    EXPECT_EQ(nameOf(LengthUnit::UsSurveyFoot), u"US ft");
    for (const LengthUnit unit : {LengthUnit::Metre, LengthUnit::Millimetre, LengthUnit::Kilometre}) {
        EXPECT_EQ(nameOf(unit), symbolOf(unit));
    }
    EXPECT_EQ(nameOf(AreaUnit::SquareMetre), u"m²");
    EXPECT_EQ(nameOf(AreaUnit::Hectare), u"ha");
    EXPECT_EQ(nameOf(AreaUnit::SquareKilometre), u"km²");
    EXPECT_EQ(nameOf(AreaUnit::SquareFoot), u"ft²");
    EXPECT_EQ(nameOf(AreaUnit::Acre), u"ac");
    EXPECT_EQ(nameOf(AngleUnit::Degree), u"°");
    EXPECT_EQ(nameOf(AngleUnit::Gon), u"gon");
    EXPECT_EQ(nameOf(AngleUnit::Radian), u"rad");
}

} // namespace
