#include "Notation.h"

#include "FormattedField.h"
#include "PrintQt.h"
#include "ValueParser.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <numbers>
#include <random>

namespace
{

using kareport::AngleUnit;
using kareport::DataUnits;
using kareport::ValueParser;

constexpr double misfit = std::numeric_limits<double>::infinity();
constexpr unsigned id = 7;

/// What a text is stored as, angles in degrees; infinite when it does not fit.
double stored(int type, const DataUnits &units, const char *text)
{
    UDictionary object;
    if (!ValueParser(type, id, units).store(text, object)) {
        return misfit;
    }
    const double value = *static_cast<const double *>(object.Find(id)->GetData());
    const bool isAngle = type == VARIABLE_ANGLE || type == VARIABLE_VANGLE || type == VARIABLE_BEARING;
    return isAngle ? value * 180 / std::numbers::pi : value;
}

struct Row
{
    int type;
    const char *text;
    double expected;
    const char *reason;
};

constexpr double angle = 45 + 30.0 / 60 + 15.0 / 3600;

constexpr Row printedTexts[] = {
    {VARIABLE_OFFSET, "12.5R", 12.5, "to the right"},
    {VARIABLE_OFFSET, "3.2 L", -3.2, "to the left, after a blank"},
    {VARIABLE_OFFSET, " 3.2l ", -3.2, "in a small letter, blanks around it"},
    {VARIABLE_OFFSET, "+12.5", 12.5, "with a sign"},
    {VARIABLE_OFFSET, "-3.2 ", -3.2, "with a sign"},
    {VARIABLE_OFFSET, "0.000", 0, "on the line"},
    {VARIABLE_OFFSET, "0.000L", 0, "on the line"},
    {VARIABLE_OFFSET, "-3.2L", misfit, "two signs"},
    {VARIABLE_OFFSET, "+3.2R", misfit, "two signs"},
    {VARIABLE_OFFSET, "R", misfit, "a side alone"},
    {VARIABLE_OFFSET, "3.2LR", misfit, "two sides"},
    {VARIABLE_OFFSET, "L3.2", misfit, "the side in front"},
    {VARIABLE_OFFSET, "infR", misfit, "not finite"},
    {VARIABLE_OFFSET, "1e3R", misfit, "an exponent"},
    {VARIABLE_OFFSET, "3.2 m", misfit, "a unit"},
    {VARIABLE_LENGTH, "12.5R", misfit, "a side is for offsets only"},
    {VARIABLE_STATION, "-0+075.000", -75, "below 0"},
    {VARIABLE_STATION, "12+345.678", 12345.678, "kilometres"},
    {VARIABLE_STATION, "123+45.678", 12345.678, "hundreds of feet"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "30'15\"",
     angle, "marks"},
    {VARIABLE_ANGLE,
     "-45\xC2\xB0"
     "30'15\"",
     -angle, "below 0"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "30'15.5\"",
     angle + 0.5 / 3600, "decimals of seconds"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "30.25'",
     angle, "decimals of minutes"},
    {VARIABLE_ANGLE, "45.5\xC2\xB0", 45.5, "decimals of degrees"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "30'15",
     angle, "the last mark is missing"},
    {VARIABLE_ANGLE, "45d30'15\"", angle, "a letter for degrees"},
    {VARIABLE_ANGLE,
     "45\xC2\xBA"
     "30\xE2\x80\xB2"
     "15\xE2\x80\xB3",
     angle, "the marks of typesetters"},
    {VARIABLE_ANGLE, "50.5g", 45.45, "gon"},
    {VARIABLE_ANGLE, "-50.5g", -45.45, "gon below 0"},
    {VARIABLE_ANGLE, "45-30-15", misfit, "hyphens alone could be anything"},
    {VARIABLE_ANGLE, "N45-30-15E", misfit, "a quadrant is for bearings only"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "30-15",
     misfit, "marks and hyphens"},
    {VARIABLE_ANGLE,
     "45\xC2\xB0"
     "60'",
     misfit, "60 minutes"},
    {VARIABLE_ANGLE, "g", misfit, "a mark alone"},
    {VARIABLE_ANGLE, "infg", misfit, "not finite"},
    {VARIABLE_ANGLE, "45.5gon", misfit, "another mark"},
    {VARIABLE_VANGLE, "100.0000g", 90, "gon"},
    {VARIABLE_LENGTH, "45.5g", misfit, "gon is for angles only"},
    {VARIABLE_BEARING, "N45-30-15E", angle, "a quadrant with hyphens"},
    {VARIABLE_BEARING,
     "S 45\xC2\xB0"
     "30'15.5\" W",
     180 + angle + 0.5 / 3600, "a quadrant with marks"},
    {VARIABLE_BEARING, "s45-30-15e", 180 - angle, "in small letters"},
    {VARIABLE_BEARING, "N 45-30-15 W", 360 - angle, "north-west"},
    {VARIABLE_BEARING,
     "N 00\xC2\xB0"
     "00'00\" W",
     0, "north, not a whole circle"},
    {VARIABLE_BEARING, "S 0 E", 180, "south"},
    {VARIABLE_BEARING, "N 90 E", 90, "east"},
    {VARIABLE_BEARING, "N 45.5 E", 45.5, "a number in the data's unit"},
    {VARIABLE_BEARING, "N 50.5g E", 45.45, "gon in a quadrant"},
    {VARIABLE_BEARING,
     "315\xC2\xB0"
     "30'15\"",
     270 + angle, "a circle with marks"},
    {VARIABLE_BEARING, "045.5000\xC2\xB0", 45.5, "a circle in degrees"},
    {VARIABLE_BEARING, "N 90-00-01 E", misfit, "more than a quarter"},
    {VARIABLE_BEARING, "N 100.1g E", misfit, "more than a quarter in gon"},
    {VARIABLE_BEARING, "N 91 E", misfit, "more than a quarter in the data's unit"},
    {VARIABLE_BEARING, "N 45 S", misfit, "no quadrant"},
    {VARIABLE_BEARING, "E 45 N", misfit, "no quadrant"},
    {VARIABLE_BEARING, "N 45", misfit, "half a quadrant"},
    {VARIABLE_BEARING, "NE", misfit, "no angle"},
    {VARIABLE_BEARING, "N  E", misfit, "no angle"},
    {VARIABLE_BEARING, "N -45 E", misfit, "a sign"},
    {VARIABLE_BEARING, "N", misfit, "a letter"},
    {VARIABLE_BEARING, "NaNE", misfit, "not a number"},
    {VARIABLE_BEARING, "-", misfit, "a sign alone"},
    {VARIABLE_THICKNESS, "ByLayer", -1, "what a layer gives"},
    {VARIABLE_THICKNESS, " BYLAYER", -1, "in capitals"},
    {VARIABLE_THICKNESS, "25", 25, "hundredths"},
    {VARIABLE_THICKNESS, "Layer", misfit, "another word"},
};

TEST(Notation, ReadsWhatIsPrinted)
{
    for (const Row &row : printedTexts) {
        const double value = stored(row.type, {}, row.text);
        if (row.expected == misfit) {
            EXPECT_EQ(value, misfit) << row.text << ": " << row.reason;
        } else {
            EXPECT_NEAR(value, row.expected, 1e-12) << row.text << ": " << row.reason;
        }
    }
}

TEST(Notation, UnitsOfTheDataCountWhereTheTextHasNone)
{
    DataUnits gons;
    gons.angle = AngleUnit::Gon;
    gons.length = kareport::LengthUnit::InternationalFoot;
    DataUnits radians;
    radians.angle = AngleUnit::Radian;
    DataUnits dms;
    dms.sexagesimal = true;
    EXPECT_DOUBLE_EQ(stored(VARIABLE_OFFSET, gons, "10L"), -3.048);
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, gons, "S 50 W"), 225) << "gon";
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, gons, "N 100 E"), 90) << "a quarter";
    EXPECT_EQ(stored(VARIABLE_BEARING, gons, "N 100.5 E"), misfit) << "more than a quarter";
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, gons, "N 45\xC2\xB0 E"), 45) << "a mark says degrees";
    EXPECT_DOUBLE_EQ(stored(VARIABLE_ANGLE, gons, "45\xC2\xB0"), 45) << "a mark says degrees";
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, radians, "S 0.5 E"), 180 - 0.5 * 180 / std::numbers::pi);
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, dms, "45-30-15"), angle);
    EXPECT_DOUBLE_EQ(stored(VARIABLE_BEARING, dms, "N45-30-15W"), 360 - angle);
    EXPECT_DOUBLE_EQ(stored(VARIABLE_ANGLE, dms, "50g"), 45) << "a mark says gon";
    EXPECT_EQ(stored(VARIABLE_ANGLE, dms, "N45-30-15W"), misfit) << "a quadrant is for bearings only";
}

/// A value as a table shows it.
std::string printed(int type, const UJobSettings &settings, double value, int decimals, bool isSigned)
{
    FormattedField field(type, 12, decimals, "R");
    field.settings = settings;
    field.suffix = isSigned ? QStringLiteral("+") : QString();
    return field.of(8, &value).toStdString();
}

/// The units that a table's values are in.
DataUnits unitsOf(const UJobSettings &settings)
{
    DataUnits units;
    units.length = settings.lengthUnit;
    units.area = settings.areaUnit;
    units.angle = settings.angleUnit;
    return units;
}

TEST(Notation, WhatIsReadAgainIsPrintedTheSame)
{
    std::mt19937 random(20240305);
    std::uniform_real_distribution<double> lengths(-20000, 20000);
    std::uniform_real_distribution<double> angles(0, 2 * std::numbers::pi);
    constexpr int lengthTypes[] = {VARIABLE_DOUBLE,   VARIABLE_COORDINATE, VARIABLE_LENGTH,
                                   VARIABLE_DISTANCE, VARIABLE_ELEVATION,  VARIABLE_STATION,
                                   VARIABLE_OFFSET,   VARIABLE_AREA,       VARIABLE_PLAIN};
    constexpr int angleTypes[] = {VARIABLE_ANGLE, VARIABLE_VANGLE, VARIABLE_BEARING};
    int compared = 0;
    for (int round = 0; round < 2000; ++round) {
        UJobSettings settings;
        settings.lengthUnit = static_cast<kareport::LengthUnit>(random() % 5);
        settings.areaUnit = static_cast<kareport::AreaUnit>(random() % 5);
        settings.angleUnit = static_cast<AngleUnit>(random() % 3);
        settings.stationFormat = static_cast<UJobSettings::StationFormat>(random() % 3);
        settings.bearingUnit = static_cast<unsigned>(random() % 3);
        settings.bearingStyle = static_cast<qint16>(random() % 2);
        settings.bearingDecimals = static_cast<qint32>(random() % 7);
        settings.bearingPadding = static_cast<qint16>(random() % 2);
        if (settings.bearingUnit == 0 && settings.bearingStyle == 1 && random() % 2 == 0) {
            settings.angleMarks = {'-', '-', '\0'};
        }
        const int decimals = static_cast<int>(random() % 5);
        const DataUnits units = unitsOf(settings);
        const auto compare = [&](int type, double value) {
            const bool isSigned = random() % 2 == 0;
            const std::string first = printed(type, settings, value, decimals, isSigned);
            UDictionary object;
            ASSERT_TRUE(ValueParser(type, id, units).store(first, object)) << "type " << type << ": " << first;
            ASSERT_NE(object.Find(id), nullptr) << "type " << type << ": " << first;
            const double read = *static_cast<const double *>(object.Find(id)->GetData());
            if (type == VARIABLE_OFFSET && first.find_first_of("123456789") == std::string::npos) {
                EXPECT_EQ(read, 0) << "what rounds to 0 keeps no side";
            } else {
                EXPECT_EQ(printed(type, settings, read, decimals, isSigned), first) << "type " << type;
            }
            ++compared;
        };
        for (const int type : lengthTypes) {
            compare(type, random() % 8 == 0 ? 0 : lengths(random));
        }
        for (const int type : angleTypes) {
            const auto quarter = static_cast<unsigned>(random() % 8);
            compare(type, quarter < 4 ? quarter * std::numbers::pi / 2 : angles(random));
        }
    }
    EXPECT_EQ(compared, 2000 * 12);
}

TEST(Notation, FlagsAndLayersAreReadAgain)
{
    UDictionary object;
    ASSERT_TRUE(ValueParser(VARIABLE_FLAG, id, {}).store("*", object));
    EXPECT_TRUE(*static_cast<const bool *>(object.Find(id)->GetData()));
    ASSERT_TRUE(ValueParser(VARIABLE_BOOLEAN, id, {}).store("N", object));
    EXPECT_FALSE(*static_cast<const bool *>(object.Find(id)->GetData()));
    const double layer = stored(VARIABLE_THICKNESS, {}, "ByLayer");
    EXPECT_NE(printed(VARIABLE_THICKNESS, UJobSettings(), layer, 2, false).find("ByLayer"), std::string::npos);
}

} // namespace
