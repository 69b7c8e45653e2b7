#include "UJobSettings.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <utility>

namespace
{

using kareport::AngleUnit;
using kareport::AreaUnit;
using kareport::LengthUnit;
using kareport::TextBuffer;

constexpr double infinite = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

TEST(UJobSettings, HasTheUsualSettingsAtFirst)
{
    const UJobSettings settings;
    EXPECT_EQ(settings.lengthUnit, LengthUnit::Metre);
    EXPECT_EQ(settings.areaUnit, AreaUnit::SquareMetre);
    EXPECT_EQ(settings.angleUnit, AngleUnit::Degree);
    EXPECT_EQ(settings.lengthDecimals, 3);
    EXPECT_EQ(settings.stationDecimals, 3);
    EXPECT_EQ(settings.numberDecimals, 3);
    EXPECT_EQ(settings.stationFormat, UJobSettings::StationFormat::ThousandsPlus);
    EXPECT_EQ(settings.northEastOrder, 1) << "northing before easting";
    EXPECT_EQ(settings.bearingUnit, 0U) << "degrees, minutes and seconds";
    EXPECT_EQ(settings.bearingStyle, 1) << "quadrant";
    EXPECT_EQ(settings.bearingDecimals, 0);
    EXPECT_EQ(settings.bearingPadding, 1);
    EXPECT_EQ(settings.bearingReference, 0U) << "north";
    EXPECT_EQ(settings.angleMarks, (std::array<char, 3>{'\xB0', '\'', '"'}));
}

TEST(UJobSettings, ACopyIsItsOwn)
{
    UJobSettings settings;
    const UJobSettings copy = settings;
    settings.lengthUnit = LengthUnit::Kilometre;
    settings.angleMarks[0] = 'd';
    EXPECT_EQ(copy.ConvertToDisplay(2000.0, 6, 0), 2000.0);
    EXPECT_EQ(copy.angleMarks[0], '\xB0');
}

TEST(UJobSettings, ConvertToDisplayByKind)
{
    UJobSettings settings;
    settings.lengthUnit = LengthUnit::Millimetre;
    settings.areaUnit = AreaUnit::Hectare;
    settings.angleUnit = AngleUnit::Gon;
    constexpr double length = 699.9999999999999; // 0.7 / 0.001; times 1000 would be 700
    constexpr double area = 7e-05;
    constexpr double angle = 44.56338406573069; // 0.7 * (200 / pi)
    struct Row
    {
        int kind;
        double expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 0.7, "integer"},
        {1, 0.7, "number"},
        {2, 0.7, "text"},
        {3, angle, "angle"},
        {4, 0.7, "a bearing has settings of its own"},
        {5, length, "coordinate"},
        {6, length, "length"},
        {7, length, "distance"},
        {8, length, "elevation"},
        {9, length, "station"},
        {10, length, "offset"},
        {11, area, "area"},
        {12, 0.7, "after the areas"},
        {17, 0.7, "before the vertical angle"},
        {18, angle, "vertical angle"},
        {19, 0.7, "after the vertical angle"},
        {22, 0.7, "a thickness is shown as given"},
        {-1, 0.7, "no kind at all"},
        {65541, 0.7, "not 5 in its low 16 bits"},
        {std::numeric_limits<int>::max(), 0.7, "no kind at all"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(settings.ConvertToDisplay(0.7, row.kind, 0), row.expected) << row.kind << ": " << row.reason;
    }
}

TEST(UJobSettings, ConvertToDisplayIsOneOperationWithoutRounding)
{
    struct Row
    {
        LengthUnit unit;
        double value;
        double expected;
        const char *reason;
    };
    constexpr Row lengths[] = {
        {LengthUnit::Metre, 0.1, 0.1, "unchanged"},
        {LengthUnit::Millimetre, 0.7, 699.9999999999999, "divided by 0.001, which is not the same as times 1000"},
        {LengthUnit::Kilometre, 123.456, 0.123456, "divided, not times 0.001"},
        {LengthUnit::InternationalFoot, 10.0, 32.808398950131235, "divided, not times 3.28..."},
        {LengthUnit::UsSurveyFoot, 123.456, 405.03856, "divided, not times 3937 / 1200"},
        {LengthUnit::InternationalFoot, -0.3048, -1.0, "negative"},
        {LengthUnit::Kilometre, infinite, infinite, "an infinite one stays so"},
        {LengthUnit::Millimetre, 1e308, infinite, "too large for a double"},
    };
    UJobSettings settings;
    for (const Row &row : lengths) {
        settings.lengthUnit = row.unit;
        EXPECT_EQ(settings.ConvertToDisplay(row.value, 6, 0), row.expected) << row.reason;
    }
    EXPECT_TRUE(std::isnan(settings.ConvertToDisplay(notANumber, 6, 0)));
    EXPECT_TRUE(std::signbit(settings.ConvertToDisplay(-0.0, 6, 0))) << "zero keeps its sign";

    constexpr std::pair<AreaUnit, double> areas[] = {
        {AreaUnit::SquareMetre, 1234.5},        {AreaUnit::Hectare, 0.12345},
        {AreaUnit::SquareKilometre, 0.0012345}, {AreaUnit::SquareFoot, 13288.04740942815},
        {AreaUnit::Acre, 0.3050515934212156},
    };
    for (const auto &[unit, expected] : areas) {
        settings.areaUnit = unit;
        EXPECT_EQ(settings.ConvertToDisplay(1234.5, 11, 0), expected);
    }

    constexpr std::pair<AngleUnit, double> angles[] = {
        {AngleUnit::Degree, 57.29577951308232},
        {AngleUnit::Gon, 63.66197723675813},
        {AngleUnit::Radian, 1.0},
    };
    for (const auto &[unit, expected] : angles) {
        settings.angleUnit = unit;
        EXPECT_EQ(settings.ConvertToDisplay(1.0, 3, 0), expected);
        EXPECT_EQ(settings.ConvertToDisplay(-1.0, 18, 0), -expected) << "never brought into one circle";
    }
}

struct LengthRow
{
    double value = 0;
    LengthUnit unit = LengthUnit::Metre;
    bool fromInternal = true;
    bool withUnit = false;
    int decimals = -1;
    int width = -1;
    bool blankZero = false;
    QStringView expected = {};
    const char *reason = "";
};

constexpr LengthRow lengthRows[] = {
    // Not finite: nothing, whatever else is asked for.
    {.value = infinite, .expected = u"", .reason = "infinite"},
    {.value = -infinite, .expected = u"", .reason = "infinite, negative"},
    {.value = notANumber, .expected = u"", .reason = "not a number"},
    {.value = infinite, .withUnit = true, .width = 8, .expected = u"", .reason = "neither unit nor width"},
    {.value = notANumber, .fromInternal = false, .expected = u"", .reason = "nor in the shown unit"},
    // Conversion.
    {.value = 1.5, .expected = u"1.500", .reason = "metres"},
    {.value = 1.5, .unit = LengthUnit::Millimetre, .expected = u"1500.000", .reason = "millimetres"},
    {.value = 1.5,
     .unit = LengthUnit::Kilometre,
     .expected = u"0.002",
     .reason = "0.0015 as a double is above the tie"},
    {.value = 0.3048, .unit = LengthUnit::InternationalFoot, .expected = u"1.000", .reason = "one foot"},
    {.value = 1200, .unit = LengthUnit::UsSurveyFoot, .expected = u"3937.000", .reason = "1200 metres are 3937 feet"},
    {.value = 1200, .unit = LengthUnit::InternationalFoot, .expected = u"3937.008", .reason = "the other foot differs"},
    {.value = 1.5,
     .unit = LengthUnit::Kilometre,
     .fromInternal = false,
     .expected = u"1.500",
     .reason = "in the shown unit already"},
    // Decimals.
    {.value = 2.0 / 3.0, .decimals = -1, .expected = u"0.667", .reason = "the settings' decimals"},
    {.value = 2.0 / 3.0, .decimals = 0, .expected = u"1", .reason = "no decimals, no point"},
    {.value = 2.0 / 3.0, .decimals = 1, .expected = u"0.7", .reason = "one"},
    {.value = 0.1, .decimals = 15, .expected = u"0.100000000000000", .reason = "the most of the settings"},
    {.value = 0.1, .decimals = 20, .expected = u"0.10000000000000000555", .reason = "more than the settings allow"},
    {.value = 2.0 / 3.0, .decimals = -2, .expected = u"1", .reason = "other negative decimals count as 0"},
    // Rounding and sign.
    {.value = 0.0625, .expected = u"0.062", .reason = "an exact tie goes to the even digit"},
    {.value = 0.1875, .expected = u"0.188", .reason = "an exact tie goes to the even digit, upwards"},
    {.value = -0.0625, .expected = u"-0.062", .reason = "the same below zero"},
    {.value = 1.0005, .expected = u"1.000", .reason = "the double is a little below the tie"},
    {.value = 999.9996, .expected = u"1000.000", .reason = "carries through"},
    {.value = -12.5, .expected = u"-12.500", .reason = "negative"},
    {.value = -0.0004, .expected = u"0.000", .reason = "only zeros are shown: no minus sign"},
    {.value = -0.0, .expected = u"0.000", .reason = "zero with a sign"},
    {.value = -0.4, .decimals = 0, .expected = u"0", .reason = "only a zero is shown: no minus sign"},
    {.value = -0.0006, .expected = u"-0.001", .reason = "a digit other than 0 is shown"},
    {.value = 1e22, .decimals = 1, .expected = u"10000000000000000000000.0", .reason = "beyond 64 bits"},
    // Blank zeros.
    {.value = 0.0, .blankZero = true, .expected = u"", .reason = "zero"},
    {.value = -0.0004, .blankZero = true, .expected = u"", .reason = "zero as it is shown"},
    {.value = 0.0006, .blankZero = true, .expected = u"0.001", .reason = "not zero as it is shown"},
    {.value = 10.0, .blankZero = true, .expected = u"10.000", .reason = "zeros after another digit"},
    {.value = 0.0, .expected = u"0.000", .reason = "zeros are shown otherwise"},
    // Unit.
    {.value = 1, .withUnit = true, .expected = u"1.000 m", .reason = "metres"},
    {.value = 1, .unit = LengthUnit::Millimetre, .withUnit = true, .expected = u"1000.000 mm", .reason = "millimetres"},
    {.value = 1, .unit = LengthUnit::Kilometre, .withUnit = true, .expected = u"0.001 km", .reason = "kilometres"},
    {.value = 0.3048,
     .unit = LengthUnit::InternationalFoot,
     .withUnit = true,
     .expected = u"1.000 ft",
     .reason = "international feet"},
    {.value = 1200,
     .unit = LengthUnit::UsSurveyFoot,
     .withUnit = true,
     .expected = u"3937.000 ft",
     .reason = "survey feet show the same symbol"},
    {.value = 0, .withUnit = true, .blankZero = true, .expected = u"", .reason = "no unit after an empty text"},
    // Width.
    {.value = 1, .width = 8, .expected = u"   1.000", .reason = "blanks before"},
    {.value = 1, .width = 5, .expected = u"1.000", .reason = "as long as wide"},
    {.value = 1, .width = 6, .expected = u" 1.000", .reason = "one more"},
    {.value = 1, .width = 4, .expected = u"1.000", .reason = "never cut"},
    {.value = 1, .width = 0, .expected = u"1.000", .reason = "none"},
    {.value = 1, .width = -8, .expected = u"1.000", .reason = "a negative width is ignored"},
    {.value = -1, .width = 8, .expected = u"  -1.000", .reason = "the sign counts and is next to the digits"},
    {.value = 1, .withUnit = true, .width = 8, .expected = u" 1.000 m", .reason = "the unit counts"},
    {.value = 1, .withUnit = true, .width = 6, .expected = u"1.000 m", .reason = "wider with its unit than asked for"},
    {.value = 0, .width = 4, .blankZero = true, .expected = u"    ", .reason = "nothing is padded as well"},
};

TEST(UJobSettings, UnitLengthToString)
{
    for (const LengthRow &row : lengthRows) {
        UJobSettings settings;
        settings.lengthUnit = row.unit;
        EXPECT_EQ(settings.UnitLengthToString(row.value, row.fromInternal, row.withUnit, row.decimals, row.width,
                                              row.blankZero),
                  row.expected.toString())
            << row.reason;
        TextBuffer out;
        out.append(u"before ");
        settings.appendUnitLength(out, row.value,
                                  {row.fromInternal, row.withUnit, row.decimals, row.width, row.blankZero});
        EXPECT_EQ(out.view().toString(), QStringLiteral("before ") + row.expected.toString())
            << row.reason << ", appended";
    }
}

TEST(UJobSettings, UnitLengthToStringTakesTheLengthDecimalsOnly)
{
    UJobSettings settings;
    settings.stationDecimals = 1;
    settings.numberDecimals = 2;
    constexpr std::pair<int, QStringView> rows[] = {{0, u"0"}, {1, u"0.1"}, {15, u"0.125000000000000"}};
    for (const auto &[decimals, expected] : rows) {
        settings.lengthDecimals = decimals;
        EXPECT_EQ(settings.UnitLengthToString(0.125, true, false, -1, -1, false), expected.toString());
    }
    EXPECT_EQ(settings.UnitLengthToString(0.125, true, false, 2, -1, false), QStringLiteral("0.12"))
        << "asked for, whatever the settings say";
}

TEST(UJobSettings, ALengthThatOverflowsInItsUnitIsNotFinite)
{
    UJobSettings settings;
    settings.lengthUnit = LengthUnit::Millimetre;
    EXPECT_EQ(settings.UnitLengthToString(1e308, true, false, -1, -1, false), QString());
    EXPECT_EQ(settings.UnitLengthToString(1e308, false, false, 0, -1, false).size(), 309) << "finite as it is";
}

} // namespace
