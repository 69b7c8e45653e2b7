#include "UJobSettings.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>
#include <utility>

namespace
{

using Format = UJobSettings::StationFormat;
using kareport::LengthUnit;
using kareport::TextBuffer;

constexpr double infinite = std::numeric_limits<double>::infinity();
constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();

struct Row
{
    double value = 0;
    Format format = Format::ThousandsPlus;
    LengthUnit unit = LengthUnit::Metre;
    bool fromInternal = true;
    bool withUnit = false;
    bool plain = false;
    int decimals = -1;
    int width = -1;
    bool blankZero = false;
    bool alignRight = false;
    bool trimZeros = false;
    bool showSign = false;
    QStringView expected = {};
    const char *reason = "";
};

QString stationOf(const UJobSettings &settings, const Row &row, bool withZone = false, bool withEquation = false)
{
    return settings.StationToString(row.value, row.fromInternal, row.withUnit, row.plain, row.decimals, row.width,
                                    withZone, withEquation, row.blankZero, row.alignRight, row.trimZeros, row.showSign);
}

UJobSettings settingsOf(const Row &row)
{
    UJobSettings settings;
    settings.stationFormat = row.format;
    settings.lengthUnit = row.unit;
    return settings;
}

template <std::size_t size>
void expectStations(const Row (&rows)[size])
{
    for (const Row &row : rows) {
        const UJobSettings settings = settingsOf(row);
        EXPECT_EQ(stationOf(settings, row), row.expected.toString()) << row.reason;
        EXPECT_EQ(stationOf(settings, row, true, true), row.expected.toString()) << row.reason << ", with zone";
        TextBuffer out;
        out.append(u"before ");
        settings.appendStation(out, row.value,
                               {row.fromInternal, row.withUnit, row.plain, row.decimals, row.width, row.blankZero,
                                row.alignRight, row.trimZeros, row.showSign});
        EXPECT_EQ(out.view().toString(), QStringLiteral("before ") + row.expected.toString())
            << row.reason << ", appended";
    }
}

TEST(UJobSettingsStation, ThatIsNotFiniteGivesNothing)
{
    constexpr Row rows[] = {
        {.value = infinite, .expected = u"", .reason = "infinite"},
        {.value = -infinite, .showSign = true, .expected = u"", .reason = "infinite, negative"},
        {.value = notANumber, .expected = u"", .reason = "not a number"},
        {.value = infinite, .format = Format::Plain, .expected = u"", .reason = "without a plus"},
        {.value = infinite, .withUnit = true, .width = 8, .expected = u"", .reason = "neither unit nor width"},
        {.value = notANumber, .fromInternal = false, .expected = u"", .reason = "nor in the shown unit"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, ThatOverflowsInItsUnitIsNotFinite)
{
    UJobSettings settings;
    settings.lengthUnit = LengthUnit::Millimetre;
    EXPECT_EQ(stationOf(settings, {.value = 1e308}), QString());
    EXPECT_EQ(stationOf(settings, {.value = 1e308, .fromInternal = false, .decimals = 0}).size(), 309 + 1)
        << "finite as it is; the plus";
}

TEST(UJobSettingsStation, PlusBeforeTheLastDigits)
{
    constexpr Row rows[] = {
        {.value = 0, .expected = u"0+000.000", .reason = "zero"},
        {.value = 5.5, .expected = u"0+005.500", .reason = "one digit"},
        {.value = 45.25, .expected = u"0+045.250", .reason = "two digits"},
        {.value = 345.25, .expected = u"0+345.250", .reason = "three digits"},
        {.value = 2345.25, .expected = u"2+345.250", .reason = "four digits need no zero"},
        {.value = 12345.678, .expected = u"12+345.678", .reason = "five digits"},
        {.value = 1234567.5, .expected = u"1234+567.500", .reason = "one plus only"},
        {.value = 999.9996, .expected = u"1+000.000", .reason = "rounded before the plus is put"},
        {.value = 1e22, .decimals = 0, .expected = u"10000000000000000000+000", .reason = "beyond 64 bits"},
        {.value = 0, .format = Format::HundredsPlus, .expected = u"0+00.000", .reason = "zero, hundreds"},
        {.value = 5.5, .format = Format::HundredsPlus, .expected = u"0+05.500", .reason = "one digit, hundreds"},
        {.value = 45.25, .format = Format::HundredsPlus, .expected = u"0+45.250", .reason = "two digits, hundreds"},
        {.value = 345.25, .format = Format::HundredsPlus, .expected = u"3+45.250", .reason = "three digits, hundreds"},
        {.value = 12345.678, .format = Format::HundredsPlus, .expected = u"123+45.678", .reason = "five, hundreds"},
        {.value = 99.9996,
         .format = Format::HundredsPlus,
         .expected = u"1+00.000",
         .reason = "rounded first, hundreds"},
        {.value = 12345.678, .format = Format::Plain, .expected = u"12345.678", .reason = "the format is plain"},
        {.value = 5.5, .format = Format::Plain, .expected = u"5.500", .reason = "no zeros before it"},
        {.value = 5.5, .plain = true, .expected = u"5.500", .reason = "plain is asked for"},
        {.value = 5.5, .format = Format::HundredsPlus, .plain = true, .expected = u"5.500", .reason = "over hundreds"},
        {.value = 5.5, .format = Format::Plain, .plain = true, .expected = u"5.500", .reason = "plain twice"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, ConvertedAndRounded)
{
    constexpr Row rows[] = {
        {.value = 1200, .unit = LengthUnit::UsSurveyFoot, .expected = u"3+937.000", .reason = "survey feet"},
        {.value = 0.3048, .unit = LengthUnit::InternationalFoot, .expected = u"0+001.000", .reason = "one foot"},
        {.value = 1.5, .unit = LengthUnit::Millimetre, .expected = u"1+500.000", .reason = "millimetres"},
        {.value = 1.5,
         .unit = LengthUnit::Millimetre,
         .fromInternal = false,
         .expected = u"0+001.500",
         .reason = "in the shown unit already"},
        {.value = 5.5, .decimals = 0, .expected = u"0+006", .reason = "no decimals, no point; tie to even above"},
        {.value = 4.5, .decimals = 0, .expected = u"0+004", .reason = "tie to even below"},
        {.value = 5.5, .decimals = 1, .expected = u"0+005.5", .reason = "one decimal"},
        {.value = 5.5, .decimals = 15, .expected = u"0+005.500000000000000", .reason = "many decimals"},
        {.value = 0.0625, .expected = u"0+000.062", .reason = "an exact tie goes to the even digit"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, TakesTheStationDecimalsOnly)
{
    UJobSettings settings;
    settings.lengthDecimals = 1;
    settings.numberDecimals = 2;
    constexpr std::pair<int, QStringView> rows[] = {{0, u"0+000"}, {1, u"0+000.1"}, {15, u"0+000.125000000000000"}};
    for (const auto &[decimals, expected] : rows) {
        settings.stationDecimals = decimals;
        EXPECT_EQ(stationOf(settings, {.value = 0.125}), expected.toString());
    }
}

TEST(UJobSettingsStation, SignOnlyWhenAskedForAndADigitIsShown)
{
    constexpr Row rows[] = {
        {.value = -5.5, .showSign = true, .expected = u"-0+005.500", .reason = "below zero"},
        {.value = -5.5, .expected = u"0+005.500", .reason = "no sign is asked for: the magnitude"},
        {.value = -5.5, .plain = true, .showSign = true, .expected = u"-5.500", .reason = "without a plus"},
        {.value = 5.5, .showSign = true, .expected = u"0+005.500", .reason = "nothing above zero"},
        {.value = -0.0004, .showSign = true, .expected = u"0+000.000", .reason = "only zeros are shown"},
        {.value = -0.0, .showSign = true, .expected = u"0+000.000", .reason = "zero with a sign"},
        {.value = -0.0006, .showSign = true, .expected = u"-0+000.001", .reason = "a digit other than 0 is shown"},
        {.value = -1500, .showSign = true, .expected = u"-1+500.000", .reason = "the sign does not move the plus"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, BlankZeroAndTrimmedZeros)
{
    constexpr Row rows[] = {
        {.value = 0, .blankZero = true, .expected = u"", .reason = "zero"},
        {.value = 0, .plain = true, .blankZero = true, .expected = u"", .reason = "zero, plain"},
        {.value = -0.0004, .blankZero = true, .showSign = true, .expected = u"", .reason = "zero as it is shown"},
        {.value = 0.0006, .blankZero = true, .expected = u"0+000.001", .reason = "not zero as it is shown"},
        {.value = 1000, .blankZero = true, .expected = u"1+000.000", .reason = "zeros after another digit"},
        {.value = 5.5, .trimZeros = true, .expected = u"0+005.5", .reason = "zeros of the fraction go"},
        {.value = 5.05, .trimZeros = true, .expected = u"0+005.05", .reason = "zeros inside stay"},
        {.value = 5, .trimZeros = true, .expected = u"0+005", .reason = "the point goes with the last of them"},
        {.value = 1000, .trimZeros = true, .expected = u"1+000", .reason = "zeros before the point stay"},
        {.value = 1000,
         .decimals = 0,
         .trimZeros = true,
         .expected = u"1+000",
         .reason = "without a fraction nothing goes"},
        {.value = 10, .plain = true, .decimals = 0, .trimZeros = true, .expected = u"10", .reason = "the same, plain"},
        {.value = 0, .trimZeros = true, .expected = u"0+000", .reason = "zero keeps its whole digits"},
        {.value = 0, .plain = true, .trimZeros = true, .expected = u"0", .reason = "zero, plain"},
        {.value = 5.125, .trimZeros = true, .expected = u"0+005.125", .reason = "no zeros to take"},
        {.value = -5.5, .trimZeros = true, .showSign = true, .expected = u"-0+005.5", .reason = "with a sign"},
        {.value = 0, .blankZero = true, .trimZeros = true, .expected = u"", .reason = "blank before trimmed"},
        {.value = 5, .withUnit = true, .trimZeros = true, .expected = u"0+005 m", .reason = "trimmed before the unit"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, WithItsUnit)
{
    constexpr Row rows[] = {
        {.value = 5.5, .withUnit = true, .expected = u"0+005.500 m", .reason = "metres"},
        {.value = 1200,
         .unit = LengthUnit::UsSurveyFoot,
         .withUnit = true,
         .expected = u"3+937.000 ft",
         .reason = "survey feet"},
        {.value = 5500, .unit = LengthUnit::Kilometre, .withUnit = true, .expected = u"0+005.500 km", .reason = "km"},
        {.value = 0, .withUnit = true, .blankZero = true, .expected = u"", .reason = "no unit after an empty text"},
    };
    expectStations(rows);
}

TEST(UJobSettingsStation, PaddedToItsWidth)
{
    constexpr Row rows[] = {
        {.value = 5.5, .width = 12, .alignRight = true, .expected = u"   0+005.500", .reason = "blanks before"},
        {.value = 5.5, .width = 12, .expected = u"0+005.500   ", .reason = "blanks after it"},
        {.value = 5.5, .width = 9, .alignRight = true, .expected = u"0+005.500", .reason = "as long as wide"},
        {.value = 5.5, .width = 4, .expected = u"0+005.500", .reason = "never cut"},
        {.value = 5.5, .width = 0, .alignRight = true, .expected = u"0+005.500", .reason = "none"},
        {.value = 5.5, .width = -12, .alignRight = true, .expected = u"0+005.500", .reason = "negative: none"},
        {.value = 5.5, .width = -12, .expected = u"0+005.500", .reason = "negative: none, left"},
        {.value = -5.5,
         .width = 12,
         .alignRight = true,
         .showSign = true,
         .expected = u"  -0+005.500",
         .reason = "the sign counts and is next to the digits"},
        {.value = 5.5,
         .withUnit = true,
         .width = 12,
         .alignRight = true,
         .expected = u" 0+005.500 m",
         .reason = "the unit counts"},
        {.value = 0, .width = 4, .blankZero = true, .expected = u"    ", .reason = "nothing is padded, left"},
        {.value = 0, .width = 4, .blankZero = true, .alignRight = true, .expected = u"    ", .reason = "and right"},
    };
    expectStations(rows);
}

} // namespace
