#include "LandXmlUnits.h"
#include "InputErrorText.h"
#include "JobFolder.h"
#include "LandXmlFile.h"

#include <gtest/gtest.h>

#include <numbers>

namespace
{

using namespace kareport;

Expected<LandXmlHeader> headerOf(const QByteArray &content)
{
    JobFolder folder;
    folder.put("road.xml", content);
    auto opened = FileBytes::open(folder.path("road.xml"));
    return readLandXmlHeader(std::get<std::shared_ptr<const FileBytes>>(opened));
}

QByteArray withUnits(const QByteArray &units)
{
    return "<LandXML version='1.2'><Project/><Units>" + units + "</Units><Surfaces/></LandXML>";
}

TEST(LandXmlUnits, LengthsAndAreas)
{
    constexpr double usFoot = 1200.0 / 3937;
    struct Row
    {
        const char *units;
        double metres, squareMetres;
    };
    const Row rows[] = {
        {"<Metric linearUnit='meter' areaUnit='squareMeter'/>", 1, 1},
        {"<Metric linearUnit='millimeter' areaUnit='hectare'/>", 0.001, 10000},
        {"<Metric linearUnit='centimeter' areaUnit='squareCentimeter'/>", 0.01, 1e-4},
        {"<Metric linearUnit='kilometer' areaUnit='squareMillimeter'/>", 1000, 1e-6},
        {"<Imperial linearUnit='foot' areaUnit='squareFoot'/>", 0.3048, 0.09290304},
        {"<Imperial linearUnit='USSurveyFoot' areaUnit='squareFoot'/>", usFoot, usFoot * usFoot},
        {"<Imperial linearUnit='foot' areaUnit='acre'/>", 0.3048, 4046.8564224},
        {"<Imperial linearUnit='USSurveyFoot' areaUnit='acre'/>", usFoot, 43560 * usFoot * usFoot},
        {"<Imperial linearUnit='inch' areaUnit='squareInch'/>", 0.0254, 0.00064516},
        {"<Imperial linearUnit='mile' areaUnit='squareMiles'/>", 1609.344, 1609.344 * 1609.344},
        {"<Metric linearUnit='Meter ' areaUnit='SQUAREMETER'/>", 1, 1},
        {"<Imperial linearUnit='US  survey foot'/>", usFoot, usFoot * usFoot},
    };
    for (const Row &row : rows) {
        const auto header = headerOf(withUnits(row.units));
        ASSERT_EQ(errorOf(header), nullptr) << row.units;
        const LandXmlUnits &units = std::get<LandXmlHeader>(header).units;
        EXPECT_DOUBLE_EQ(units.metres, row.metres) << row.units;
        EXPECT_DOUBLE_EQ(units.squareMetres, row.squareMetres) << row.units;
    }
}

TEST(LandXmlUnits, AnotherUnitOfHeightsIsTold)
{
    struct Row
    {
        const char *units;
        const char *other;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<Metric linearUnit='meter'/>", "", "none is stated"},
        {"<Metric linearUnit='meter' elevationUnit='meter'/>", "", "the same"},
        {"<Imperial linearUnit='USSurveyFoot' elevationUnit='feet'/>", "", "the feet differ by less than the digits"},
        {"<Imperial linearUnit='foot' elevationUnit='meter'/>", "meter", "heights in metres"},
    };
    for (const Row &row : rows) {
        const auto header = headerOf(withUnits(row.units));
        ASSERT_EQ(errorOf(header), nullptr) << row.reason;
        EXPECT_EQ(std::get<LandXmlHeader>(header).otherElevationUnit, QString::fromLatin1(row.other)) << row.reason;
    }
    landxml::LandXmlFile file(withUnits("\n<Imperial linearUnit='foot' elevationUnit='meter'/>"),
                              landxml::queryOf(LandXmlListKind::Elements));
    file.rows();
    EXPECT_EQ(file.notes(),
              QStringList(u"2:1: elevationUnit is \"meter\": heights are taken to be in the unit of lengths"_qs));
}

TEST(LandXmlUnits, AnglesAndDirections)
{
    struct Row
    {
        const char *angular, *direction;
        LandXmlAngle angle, bearing;
    };
    const Row rows[] = {
        {"radians", "grads", LandXmlAngle::Radians, LandXmlAngle::Grads},
        {"decimal degrees", "decimal dd.mm.ss", LandXmlAngle::Degrees, LandXmlAngle::DegreesMinutesSeconds},
        {"decimal  degrees", " decimal dd.mm.ss", LandXmlAngle::Degrees, LandXmlAngle::DegreesMinutesSeconds},
    };
    for (const Row &row : rows) {
        const auto header = headerOf(withUnits(QByteArray("<Metric linearUnit='meter' angularUnit='") + row.angular +
                                               "' directionUnit='" + row.direction + "'/>"));
        ASSERT_EQ(errorOf(header), nullptr) << row.angular;
        EXPECT_EQ(std::get<LandXmlHeader>(header).units.angle, row.angle) << row.angular;
        EXPECT_EQ(std::get<LandXmlHeader>(header).units.direction, row.bearing) << row.direction;
    }
    const auto none = headerOf(withUnits("<Metric linearUnit='meter'/>"));
    EXPECT_EQ(std::get<LandXmlHeader>(none).units.angle, LandXmlAngle::Radians) << "as the format has it";
}

TEST(LandXmlUnits, WithoutThemNothingIsRead)
{
    struct Row
    {
        QByteArray content;
        const char *contains;
        const char *reason;
    };
    const Row rows[] = {
        {withUnits("<Metric linearUnit='cubit'/>"), "linearUnit=\"cubit\"", "a length that is not known"},
        {withUnits("<Metric/>"), "linearUnit=\"\"", "no length"},
        {withUnits("<Metric linearUnit='meter' areaUnit='barn'/>"), "areaUnit=\"barn\"", "an area"},
        {withUnits("<Metric linearUnit='meter' elevationUnit='fathom'/>"), "elevationUnit=\"fathom\"", "a height"},
        {withUnits("<Metric linearUnit='meter' angularUnit='mils'/>"), "angularUnit=\"mils\"", "an angle"},
        {withUnits("<Metric linearUnit='meter' directionUnit='mils'/>"), "directionUnit=\"mils\"", "a direction"},
        {withUnits(""), "has no units", "no system of units"},
        {"<LandXML><CgPoints/></LandXML>", "has no units", "none at all"},
        {"<svg/>", "\"svg\"", "another vocabulary"},
        {"", "XML", "an empty file"},
    };
    for (const Row &row : rows) {
        const auto header = headerOf(row.content);
        const InputError *error = errorOf(header);
        ASSERT_NE(error, nullptr) << row.reason;
        EXPECT_TRUE(error->text.contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << error->text.toStdString();
    }
}

TEST(LandXmlUnits, TheVersionIsTold)
{
    for (const char *version : {"1.0", "1.1", "1.2", "2.0"}) {
        const auto header = headerOf(QByteArray("<LandXML version='") + version +
                                     "'><Units><Metric linearUnit='meter'/></Units></LandXML>");
        EXPECT_EQ(std::get<LandXmlHeader>(header).version, QString::fromLatin1(version));
    }
}

TEST(LandXmlUnits, AnglesAreReadAsTheirUnitWritesThem)
{
    constexpr double degree = std::numbers::pi / 180;
    constexpr auto sexagesimal = LandXmlAngle::DegreesMinutesSeconds;
    struct Row
    {
        const char *text;
        LandXmlAngle form;
        double radians;
    };
    const Row rows[] = {
        {"1.5", LandXmlAngle::Radians, 1.5},
        {"100", LandXmlAngle::Grads, std::numbers::pi / 2},
        {"-90", LandXmlAngle::Degrees, -std::numbers::pi / 2},
        {"45.3015", sexagesimal, (45 + 30 / 60.0 + 15 / 3600.0) * degree},
        {"45.30155", sexagesimal, (45 + 30 / 60.0 + 15.5 / 3600.0) * degree},
        {"45.30.15", sexagesimal, (45 + 30 / 60.0 + 15 / 3600.0) * degree},
        {"45.30.155", sexagesimal, (45 + 30 / 60.0 + 15.5 / 3600.0) * degree},
        {"-0.3", sexagesimal, -30 / 60.0 * degree},
        {"45", sexagesimal, 45 * degree},
        {"45.", sexagesimal, 45 * degree},
        {"+7.0905", sexagesimal, (7 + 9 / 60.0 + 5 / 3600.0) * degree},
    };
    for (const Row &row : rows) {
        double radians = 0;
        EXPECT_TRUE(parseLandXmlAngle(row.text, row.form, radians)) << row.text;
        EXPECT_NEAR(radians, row.radians, 1e-15) << row.text;
    }
    double radians = 0;
    for (const char *wrong : {"45.6015", "45.3060", "", "-", "a", "45,30", "45.3a", "1e2"}) {
        EXPECT_FALSE(parseLandXmlAngle(wrong, sexagesimal, radians)) << wrong;
    }
    for (const char *wrong : {"", "1,5", "INF", "1.5.5"}) {
        EXPECT_FALSE(parseLandXmlAngle(wrong, LandXmlAngle::Degrees, radians)) << wrong;
    }
}

} // namespace
