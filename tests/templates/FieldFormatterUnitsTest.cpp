#include "FormattedField.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <numbers>

using kareport::LengthUnit;

namespace
{

TEST(FieldFormatterUnits, LengthsAreShownInTheLengthUnit)
{
    const struct
    {
        LengthUnit unit;
        double metres;
        const char *expected;
        const char *reason;
    } rows[] = {
        {LengthUnit::Metre, 1, "1.000", "metres"},
        {LengthUnit::Millimetre, 1.5, "1500.000", "millimetres"},
        {LengthUnit::Kilometre, 1234.5, "1.234", "kilometres: the tie is a little below"},
        {LengthUnit::InternationalFoot, 0.3048, "1.000", "international feet"},
        {LengthUnit::UsSurveyFoot, 1200.0 / 3937.0, "1.000", "US survey feet"},
        {LengthUnit::UsSurveyFoot, 1200, "3937.000", "1200 metres are exactly 3937 US survey feet"},
        {LengthUnit::InternationalFoot, 1200, "3937.008", "and a little more international ones"},
    };
    for (const auto &row : rows) {
        for (const int type : {5, 6, 7, 8}) {
            FormattedField formatted(type, 0, 1);
            formatted.settings.lengthUnit = row.unit;
            EXPECT_EQ(formatted.of(row.metres), QString::fromLatin1(row.expected)) << row.reason << ", type " << type;
        }
    }
}

TEST(FieldFormatterUnits, StationsAndOffsetsAreShownInTheLengthUnit)
{
    FormattedField station(9, 0);
    station.settings.lengthUnit = LengthUnit::UsSurveyFoot;
    station.settings.stationFormat = UJobSettings::StationFormat::HundredsPlus;
    station.settings.stationDecimals = 2;
    EXPECT_EQ(station.of(1200.0), QStringLiteral("39+37.00"));
    FormattedField offset(10, 0, 2);
    offset.settings.lengthUnit = LengthUnit::UsSurveyFoot;
    EXPECT_EQ(offset.of(-1200.0 / 3937.0 * 2.5), QStringLiteral("2.50L"));
    offset.settings.lengthUnit = LengthUnit::Kilometre;
    EXPECT_EQ(offset.of(9e-7), QStringLiteral("0.00")) << "what counts as zero is the shown value";
}

TEST(FieldFormatterUnits, AreasAnglesAndNumbersFollowTheSettings)
{
    FormattedField area(11, 0, 1);
    area.settings.areaUnit = kareport::AreaUnit::Hectare;
    area.settings.numberDecimals = 2;
    EXPECT_EQ(area.of(12500.0), QStringLiteral("1.25"));
    area.settings.areaUnit = kareport::AreaUnit::Acre;
    EXPECT_EQ(area.of(4046.8564224), QStringLiteral("1.00"));

    for (const int type : {3, 18}) {
        FormattedField angle(type, 0, 1);
        angle.settings.angleUnit = kareport::AngleUnit::Gon;
        EXPECT_EQ(angle.of(std::numbers::pi / 2), QStringLiteral("100.0")) << type;
        angle.settings.angleUnit = kareport::AngleUnit::Radian;
        EXPECT_EQ(angle.of(0.5), QStringLiteral("0.5")) << type;
    }
    for (const int type : {1, 21}) {
        FormattedField number(type, 0, 5);
        number.settings.numberDecimals = 0;
        number.settings.lengthUnit = LengthUnit::Millimetre;
        number.settings.areaUnit = kareport::AreaUnit::Hectare;
        EXPECT_EQ(number.of(2.0), QStringLiteral("2")) << type << ": a plain number has no unit";
    }
    FormattedField thickness(22, 0, 2);
    thickness.settings.lengthUnit = LengthUnit::Millimetre;
    EXPECT_EQ(thickness.of(250.0), QStringLiteral("2.50")) << "a thickness has no unit";
}

TEST(FieldFormatterUnits, BearingsFollowTheSettings)
{
    FormattedField bearing(4, 0);
    bearing.settings.angleMarks = {'d', 'm', 's'};
    EXPECT_EQ(bearing.of(0.5), QStringLiteral("N 28d38m52s E"));
    bearing.settings.angleMarks = {'\xBA', '\0', '\0'};
    EXPECT_EQ(bearing.of(0.5), QStringLiteral("N 28º3852 E")) << "marks are Latin-1, the character 0 is not shown";
    bearing.settings.bearingStyle = 0;
    bearing.settings.bearingUnit = 1;
    bearing.settings.bearingDecimals = 4;
    EXPECT_EQ(bearing.of(0.5), QStringLiteral("028.6479º"));
    bearing.settings.bearingPadding = 0;
    bearing.settings.bearingReference = 1;
    EXPECT_EQ(bearing.of(0.5), QStringLiteral("208.6479º")) << "half a circle more from the south";
    bearing.settings.angleUnit = kareport::AngleUnit::Gon;
    bearing.settings.lengthUnit = LengthUnit::Kilometre;
    EXPECT_EQ(bearing.of(0.5), QStringLiteral("208.6479º")) << "no other unit touches a bearing";
}

TEST(FieldFormatterUnits, IdAndMarkerComeFromTheField)
{
    FormattedField formatted(2, 4);
    formatted.field.ID = -1;
    EXPECT_EQ(kareport::FieldFormatter(formatted.field).id(), 0xFFFFFFFFU);
    formatted.field.ID = 7;
    EXPECT_EQ(kareport::FieldFormatter(formatted.field).id(), 7U);
    EXPECT_EQ(kareport::FieldFormatter(formatted.field).marker(), kareport::FieldMarker::None);
    formatted.field.VariableName = QStringLiteral("Suffix_+");
    EXPECT_EQ(kareport::FieldFormatter(formatted.field).marker(), kareport::FieldMarker::SuffixPlus);
}

} // namespace
