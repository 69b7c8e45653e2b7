#include "JobReader.h"

#include "JobFolder.h"
#include "OrientationOrder.h"

#include <QDir>

#include "JobText.h"

#include <gtest/gtest.h>

namespace
{

using jobtext::jobOf;

TEST(JobSettings, SettingsHaveTheHostsDefaults)
{
    for (const char *json : {R"({"report": []})", R"({"report": [], "settings": {}})"}) {
        const UJobSettings settings = jobOf(json).settings;
        EXPECT_EQ(settings.lengthUnit, kareport::LengthUnit::Metre);
        EXPECT_EQ(settings.areaUnit, kareport::AreaUnit::SquareMetre);
        EXPECT_EQ(settings.angleUnit, kareport::AngleUnit::Degree);
        EXPECT_EQ(settings.lengthDecimals, 3);
        EXPECT_EQ(settings.stationDecimals, 3);
        EXPECT_EQ(settings.numberDecimals, 3);
        EXPECT_EQ(settings.stationFormat, UJobSettings::StationFormat::ThousandsPlus);
        EXPECT_EQ(settings.northEastOrder, ORDER_NORTHING_EASTING);
        EXPECT_EQ(settings.bearingUnit, 0U) << "dms";
        EXPECT_EQ(settings.bearingStyle, 1) << "quadrant";
        EXPECT_EQ(settings.bearingDecimals, 0);
        EXPECT_EQ(settings.bearingPadding, 1);
        EXPECT_EQ(settings.bearingReference, 0U) << "north";
        EXPECT_EQ(settings.angleMarks, (std::array<char, 3>{'\xB0', '\'', '"'}));
    }
}

TEST(JobSettings, ReadsEverySettingByItsKey)
{
    struct Row
    {
        const char *setting;
        bool (*holds)(const UJobSettings &settings);
    };
    using S = const UJobSettings &;
    constexpr Row rows[] = {
        {R"("lengthUnit": "m")", [](S s) { return s.lengthUnit == kareport::LengthUnit::Metre; }},
        {R"("lengthUnit": "mm")", [](S s) { return s.lengthUnit == kareport::LengthUnit::Millimetre; }},
        {R"("lengthUnit": "km")", [](S s) { return s.lengthUnit == kareport::LengthUnit::Kilometre; }},
        {R"("lengthUnit": "ft")", [](S s) { return s.lengthUnit == kareport::LengthUnit::InternationalFoot; }},
        {R"("lengthUnit": "usft")", [](S s) { return s.lengthUnit == kareport::LengthUnit::UsSurveyFoot; }},
        {R"("areaUnit": "m2")", [](S s) { return s.areaUnit == kareport::AreaUnit::SquareMetre; }},
        {R"("areaUnit": "ha")", [](S s) { return s.areaUnit == kareport::AreaUnit::Hectare; }},
        {R"("areaUnit": "km2")", [](S s) { return s.areaUnit == kareport::AreaUnit::SquareKilometre; }},
        {R"("areaUnit": "ft2")", [](S s) { return s.areaUnit == kareport::AreaUnit::SquareFoot; }},
        {R"("areaUnit": "ac")", [](S s) { return s.areaUnit == kareport::AreaUnit::Acre; }},
        {R"("angleUnit": "deg")", [](S s) { return s.angleUnit == kareport::AngleUnit::Degree; }},
        {R"("angleUnit": "gon")", [](S s) { return s.angleUnit == kareport::AngleUnit::Gon; }},
        {R"("angleUnit": "rad")", [](S s) { return s.angleUnit == kareport::AngleUnit::Radian; }},
        {R"("lengthDecimals": 0)", [](S s) { return s.lengthDecimals == 0; }},
        {R"("lengthDecimals": 15)", [](S s) { return s.lengthDecimals == 15; }},
        {R"("stationDecimals": 0)", [](S s) { return s.stationDecimals == 0; }},
        {R"("stationDecimals": 15)", [](S s) { return s.stationDecimals == 15; }},
        {R"("numberDecimals": 0)", [](S s) { return s.numberDecimals == 0; }},
        {R"("numberDecimals": 15)", [](S s) { return s.numberDecimals == 15; }},
        {R"("stationFormat": "plain")", [](S s) { return s.stationFormat == UJobSettings::StationFormat::Plain; }},
        {R"("stationFormat": "0+00")",
         [](S s) { return s.stationFormat == UJobSettings::StationFormat::HundredsPlus; }},
        {R"("stationFormat": "0+000")",
         [](S s) { return s.stationFormat == UJobSettings::StationFormat::ThousandsPlus; }},
        {R"("northEastOrder": "NE")", [](S s) { return s.northEastOrder == ORDER_NORTHING_EASTING; }},
        {R"("northEastOrder": "EN")", [](S s) { return s.northEastOrder == ORDER_EASTING_NORTHING; }},
        {R"("bearingUnit": "dms")", [](S s) { return s.bearingUnit == 0; }},
        {R"("bearingUnit": "deg")", [](S s) { return s.bearingUnit == 1; }},
        {R"("bearingUnit": "gon")", [](S s) { return s.bearingUnit == 2; }},
        {R"("bearingStyle": "circle")", [](S s) { return s.bearingStyle == 0; }},
        {R"("bearingStyle": "quadrant")", [](S s) { return s.bearingStyle == 1; }},
        {R"("bearingDecimals": 9)", [](S s) { return s.bearingDecimals == 9; }},
        {R"("bearingPadding": false)", [](S s) { return s.bearingPadding == 0; }},
        {R"("bearingPadding": true)", [](S s) { return s.bearingPadding == 1; }},
        {R"("bearingReference": "north")", [](S s) { return s.bearingReference == 0; }},
        {R"("bearingReference": "south")", [](S s) { return s.bearingReference == 1; }},
        {R"("angleMarks": ["d", "m", ""])",
         [](S s) {
             return s.angleMarks == std::array<char, 3>{'d', 'm', '\0'};
         }},
        {R"("angleMarks": ["\u00ff", "\u00b4", "-"])",
         [](S s) {
             return s.angleMarks == std::array<char, 3>{'\xFF', '\xB4', '-'};
         }},
    };
    for (const Row &row : rows) {
        const QByteArray json = QByteArray(R"({"report": [], "settings": {)") + row.setting + "}}";
        EXPECT_TRUE(row.holds(jobOf(json).settings)) << row.setting;
    }
}

TEST(JobSettings, ReadsEveryUnitOfADataSet)
{
    using U = const kareport::DataUnits &;
    struct Row
    {
        const char *units;
        bool (*holds)(const kareport::DataUnits &units);
    };
    constexpr Row rows[] = {
        {"{}",
         [](U u) { return u.length == kareport::LengthUnit::Metre && u.area == kareport::AreaUnit::SquareMetre; }},
        {"{}", [](U u) { return u.angle == kareport::AngleUnit::Degree && !u.sexagesimal; }},
        {R"({"length": "m"})", [](U u) { return u.length == kareport::LengthUnit::Metre; }},
        {R"({"length": "mm"})", [](U u) { return u.length == kareport::LengthUnit::Millimetre; }},
        {R"({"length": "km"})", [](U u) { return u.length == kareport::LengthUnit::Kilometre; }},
        {R"({"length": "ft"})", [](U u) { return u.length == kareport::LengthUnit::InternationalFoot; }},
        {R"({"length": "usft"})", [](U u) { return u.length == kareport::LengthUnit::UsSurveyFoot; }},
        {R"({"area": "m2"})", [](U u) { return u.area == kareport::AreaUnit::SquareMetre; }},
        {R"({"area": "ha"})", [](U u) { return u.area == kareport::AreaUnit::Hectare; }},
        {R"({"area": "km2"})", [](U u) { return u.area == kareport::AreaUnit::SquareKilometre; }},
        {R"({"area": "ft2"})", [](U u) { return u.area == kareport::AreaUnit::SquareFoot; }},
        {R"({"area": "ac"})", [](U u) { return u.area == kareport::AreaUnit::Acre; }},
        {R"({"angle": "deg"})", [](U u) { return u.angle == kareport::AngleUnit::Degree && !u.sexagesimal; }},
        {R"({"angle": "gon"})", [](U u) { return u.angle == kareport::AngleUnit::Gon && !u.sexagesimal; }},
        {R"({"angle": "rad"})", [](U u) { return u.angle == kareport::AngleUnit::Radian && !u.sexagesimal; }},
        {R"({"angle": "dms"})", [](U u) { return u.angle == kareport::AngleUnit::Degree && u.sexagesimal; }},
    };
    for (const Row &row : rows) {
        const QByteArray json =
            QByteArray(R"({"report": [], "data": {"p": {"csv": "p.csv", "units": )") + row.units + "}}}";
        EXPECT_TRUE(row.holds(jobOf(json).data[QStringLiteral("p")].units)) << row.units;
    }
}

} // namespace
