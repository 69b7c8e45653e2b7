#include "ValueParser.h"

#include "PrintQt.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <limits>
#include <numbers>
#include <string>

namespace
{

using kareport::DataUnits;
using kareport::parseNumber;
using kareport::parseSexagesimal;
using kareport::ValueParser;

constexpr double infinite = std::numeric_limits<double>::infinity();
constexpr unsigned id = 7;

TEST(ParseNumber, ReadsWhatIsANumber)
{
    struct Row
    {
        const char *text;
        double expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"0", 0, "zero"},
        {"1250.5", 1250.5, "a decimal point"},
        {"-12.25", -12.25, "a sign"},
        {"+12.25", 12.25, "a plus in front"},
        {" 7 ", 7, "blanks around it"},
        {"\t7", 7, "a tab in front"},
        {"00012.500", 12.5, "zeros around it"},
        {"1e3", 1000, "an exponent"},
        {"1E3", 1000, "an exponent in capitals"},
        {"1e+3", 1000, "an exponent with a plus"},
        {"-2.5e-3", -0.0025, "an exponent below 0"},
        {"0.1", 0.1, "the nearest double"},
        {"12345678901234567890", 12345678901234567890.0, "more digits than 64 bits hold"},
        {"1.7976931348623157e308", 1.7976931348623157e308, "the largest number"},
        {"5e-324", 5e-324, "the smallest number"},
        {"1e-400", 0, "too small for a double is 0"},
        {"INF", infinite, "infinite"},
        {"inf", infinite, "in small letters"},
        {"-INF", -infinite, "infinite below 0"},
        {"+INF", infinite, "with a plus"},
    };
    for (const Row &row : rows) {
        double number = -1;
        EXPECT_TRUE(parseNumber(row.text, number)) << row.text << ": " << row.reason;
        EXPECT_EQ(number, row.expected) << row.text << ": " << row.reason;
    }
    for (const char *text : {"NAN", "nan", "NaN", "-NAN"}) {
        double number = -1;
        EXPECT_TRUE(parseNumber(text, number)) << text;
        EXPECT_TRUE(std::isnan(number)) << text;
    }
}

TEST(ParseNumber, RefusesWhatIsNone)
{
    struct Row
    {
        std::string_view text;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "nothing"},
        {" ", "a blank"},
        {"+", "a sign alone"},
        {"-", "a sign alone"},
        {".", "a point alone"},
        {"e5", "an exponent alone"},
        {"1e", "an exponent without digits"},
        {"--1", "two signs"},
        {"+-1", "two signs"},
        {"-+1", "two signs"},
        {"++1", "two signs"},
        {"- 1", "a blank behind the sign"},
        {"1,5", "a decimal comma"},
        {"1 000", "a blank inside"},
        {"1.2.3", "two points"},
        {"0x10", "no other base"},
        {"12abc", "letters behind it"},
        {"12 m", "a unit behind it"},
        {"12+345.678", "a station is no plain number"},
        {"nan(1)", "what only C writes"},
        {"infinit", "half a word"},
        {"1e400", "out of range"},
        {"-1e400", "out of range below 0"},
        {std::string_view("1\0", 2), "a zero byte behind it"},
        {"\xD9\xA1", "digits of another script"},
        {"\xC2\xA0" "1", "another blank"},
    };
    for (const Row &row : rows) {
        double number = 0;
        EXPECT_FALSE(parseNumber(row.text, number)) << std::string(row.text) << ": " << row.reason;
    }
}

TEST(ParseNumber, DoesNotDependOnTheLanguage)
{
    const std::string before = std::setlocale(LC_NUMERIC, nullptr);
    const char *found = nullptr;
    for (const char *name : {"de_DE.UTF-8", "de_DE.utf8", "de_DE", "fr_FR.UTF-8", "German_Germany.1252"}) {
        found = found == nullptr ? std::setlocale(LC_NUMERIC, name) : found;
    }
    if (found == nullptr) {
        GTEST_SKIP() << "no language with a decimal comma is installed";
    }
    double usual = 0;
    double tiny = 1;
    const bool read = parseNumber("12.5", usual) && parseNumber("12.5e-400", tiny);
    std::setlocale(LC_NUMERIC, before.c_str());
    EXPECT_TRUE(read);
    EXPECT_EQ(usual, 12.5);
    EXPECT_EQ(tiny, 0) << "also where the number is too small for a double";
}

TEST(ParseSexagesimal, ReadsEverySpelling)
{
    struct Row
    {
        const char *text;
        double expected;
        const char *reason;
    };
    constexpr double angle = 45 + 30.0 / 60 + 15.0 / 3600;
    constexpr double angleAndHalf = 45 + 30.0 / 60 + 15.5 / 3600;
    constexpr Row rows[] = {
        {"45-30-15", angle, "with hyphens"},
        {"45-30-15.5", angleAndHalf, "with decimals of seconds"},
        {"45\xC2\xB0" "30'15\"", angle, "with marks"},
        {"45\xC2\xB0" "30'15.5\"", angleAndHalf, "with marks and decimals"},
        {"-45-30-15", -angle, "negative: minutes and seconds too"},
        {"-45\xC2\xB0" "30'15.5\"", -angleAndHalf, "negative with marks"},
        {"-0-30-0", -0.5, "negative with no degrees"},
        {"0-0-0", 0, "nothing"},
        {"0-0-36", 0.01, "seconds only"},
        {"359-59-59.999", 359 + 59.0 / 60 + 59.999 / 3600, "nearly a circle"},
        {"400-0-0", 400, "more than a circle"},
        {"045-05-09", 45 + 5.0 / 60 + 9.0 / 3600, "filled with zeros"},
        {" 45-30-15 ", angle, "blanks around it"},
        {"45-30", 45.5, "without seconds"},
        {"45\xC2\xB0" "30'", 45.5, "without seconds, with marks"},
        {"45", 45, "degrees only"},
        {"45\xC2\xB0", 45, "degrees only, with their mark"},
        {"-45.25", -45.25, "decimals of degrees"},
        {"45-30.5", 45 + 30.5 / 60, "decimals of minutes"},
    };
    for (const Row &row : rows) {
        double degrees = -1;
        EXPECT_TRUE(parseSexagesimal(row.text, degrees)) << row.text << ": " << row.reason;
        EXPECT_NEAR(degrees, row.expected, 1e-12) << row.text << ": " << row.reason;
    }
}

TEST(ParseSexagesimal, RefusesWhatIsNone)
{
    struct Row
    {
        const char *text;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "nothing"},
        {"-", "a sign alone"},
        {"\xC2\xB0", "a mark alone"},
        {"45-60-0", "60 minutes"},
        {"45-30-60", "60 seconds"},
        {"45-30-61.5", "more than 60 seconds"},
        {"45-", "minutes are announced, but missing"},
        {"45-30-", "seconds are announced, but missing"},
        {"45--30-15", "minutes below 0"},
        {"--45-30-15", "two signs"},
        {"45.5-30-15", "decimals of degrees before minutes"},
        {"45-30.5-15", "decimals of minutes before seconds"},
        {"45-30-15-10", "a fourth part"},
        {"45-30-15\"x", "something behind it"},
        {"45'30\"", "minutes without degrees in front"},
        {"45\xC2\xB0" "30\"", "the mark of seconds behind minutes"},
        {"45 30 15", "blanks between"},
        {"45:30:15", "colons between"},
        {"45\xB0" "30'15\"", "a mark in Latin-1"},
        {"4e1-30-15", "an exponent"},
        {"N 45-30-15 E", "a quadrant"},
        {"1.5.5", "two points"},
        {"abc", "letters"},
    };
    for (const Row &row : rows) {
        double degrees = 0;
        EXPECT_FALSE(parseSexagesimal(row.text, degrees)) << row.text << ": " << row.reason;
    }
}

/// What a text is stored as: the kind and the value, "none" or "misfit".
QString stored(const ValueParser &parser, std::string_view text)
{
    UDictionary object;
    if (!parser.store(text, object)) {
        return QStringLiteral("misfit");
    }
    const UDictEntry *entry = object.Find(id);
    if (entry == nullptr) {
        return QStringLiteral("none");
    }
    const QString kind = QString::number(entry->GetKind()) + u' ';
    switch (entry->GetKind()) {
    case 1: return kind + (*static_cast<const bool *>(entry->GetData()) ? u"yes" : u"no");
    case 4: return kind + QString::number(*static_cast<const qint32 *>(entry->GetData()));
    case 8: return kind + QString::number(*static_cast<const double *>(entry->GetData()), 'g', 17);
    case 16: return kind + *static_cast<const QString *>(entry->GetData());
    case 32: return kind + static_cast<const UPointNumber *>(entry->GetData())->Convert();
    default: return kind + u'?';
    }
}

TEST(ValueParser, StoresByTheTypeOfTheVariable)
{
    struct Row
    {
        int type;
        const char *text;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {VARIABLE_INTEGER, "12", "4 12", "kind 4"},
        {VARIABLE_INTEGER, "+12", "4 12", "a plus"},
        {VARIABLE_INTEGER, " -12 ", "4 -12", "blanks around it"},
        {VARIABLE_INTEGER, "2147483647", "4 2147483647", "the largest"},
        {VARIABLE_INTEGER, "-2147483648", "4 -2147483648", "the smallest"},
        {VARIABLE_INTEGER, "2147483648", "misfit", "one too large"},
        {VARIABLE_INTEGER, "-2147483649", "misfit", "one too small"},
        {VARIABLE_INTEGER, "1.5", "misfit", "not whole"},
        {VARIABLE_INTEGER, "INF", "misfit", "not whole"},
        {VARIABLE_INTEGER, "0x1F", "misfit", "no other base"},
        {VARIABLE_INTEGER, "12a", "misfit", "letters"},
        {VARIABLE_TEXT, "ab", "16 ab", "kind 16"},
        {VARIABLE_TEXT, " ab ", "16  ab ", "blanks are part of a text"},
        {VARIABLE_TEXT, "12", "16 12", "digits are a text"},
        {VARIABLE_TEXT, "Gr\xC3\xB6\xC3\x9F" "e \xF0\x9D\x84\x9E", "16 Gr\xC3\xB6\xC3\x9F" "e \xF0\x9D\x84\x9E", "UTF-8"},
        {VARIABLE_NAME, "ab", "16 ab", "kind 16"},
        {VARIABLE_NUMBER, "BM-3", "32 BM-3", "kind 32"},
        {VARIABLE_NUMBER, "007", "32 007", "a point's number keeps its zeros"},
        {VARIABLE_DOUBLE, "2.5", "8 2.5", "as given"},
        {VARIABLE_DOUBLE, "INF", "8 inf", "infinite is a number"},
        {VARIABLE_DOUBLE, "NAN", "8 nan", "not-a-number is a number"},
        {VARIABLE_DOUBLE, "two", "misfit", "a word"},
        {VARIABLE_COORDINATE, "2.5", "8 2.5", "metres"},
        {VARIABLE_LENGTH, "2.5", "8 2.5", "metres"},
        {VARIABLE_LENGTH, "1+234", "misfit", "a plus inside is for stations only"},
        {VARIABLE_DISTANCE, "2.5", "8 2.5", "metres"},
        {VARIABLE_ELEVATION, "-INF", "8 -inf", "infinite below 0"},
        {VARIABLE_OFFSET, "-2.5", "8 -2.5", "metres"},
        {VARIABLE_AREA, "2.5", "8 2.5", "square metres"},
        {VARIABLE_THICKNESS, "-1", "8 -1", "as given"},
        {VARIABLE_PLAIN, "2.5", "8 2.5", "as given"},
        {12, "2.5", "8 2.5", "every other type is a number as given"},
        {-1, "2.5", "8 2.5", "every other type is a number as given"},
        {VARIABLE_STATION, "12+345.678", "8 12345.678", "the plus is dropped"},
        {VARIABLE_STATION, "123+45.678", "8 12345.678", "wherever it stands"},
        {VARIABLE_STATION, "0+000", "8 0", "zero"},
        {VARIABLE_STATION, "-1+234.5", "8 -1234.5", "negative"},
        {VARIABLE_STATION, "+1+234.5", "8 1234.5", "a plus in front is a sign"},
        {VARIABLE_STATION, "12345.5", "8 12345.5", "without a plus"},
        {VARIABLE_STATION, "1e+3", "8 1000", "the plus of an exponent"},
        {VARIABLE_STATION, "INF", "8 inf", "infinite"},
        {VARIABLE_STATION, "1+2+3", "misfit", "two pluses"},
        {VARIABLE_STATION, "12+", "misfit", "nothing behind the plus"},
        {VARIABLE_STATION, "+", "misfit", "a plus alone"},
        {VARIABLE_STATION, "12+-345", "misfit", "a sign behind the plus"},
        {VARIABLE_STATION, "12++345", "misfit", "two pluses"},
        {VARIABLE_STATION, "12-345", "misfit", "a minus is no plus"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(stored(ValueParser(row.type, id, DataUnits()), row.text), QString::fromUtf8(row.expected))
            << "type " << row.type << ", " << row.text << ": " << row.reason;
    }
}

TEST(ValueParser, BooleansAndFlagsTakeTheirWordsInAnyCase)
{
    struct Row
    {
        const char *text;
        const char *expected;
    };
    constexpr Row rows[] = {
        {"true", "1 yes"}, {"TRUE", "1 yes"}, {"yes", "1 yes"}, {"Yes", "1 yes"}, {"y", "1 yes"},  {"Y", "1 yes"},
        {"t", "1 yes"},    {"T", "1 yes"},    {"1", "1 yes"},   {"*", "1 yes"},   {" y ", "1 yes"}, {"false", "1 no"},
        {"False", "1 no"}, {"no", "1 no"},    {"NO", "1 no"},   {"n", "1 no"},    {"N", "1 no"},   {"f", "1 no"},
        {"F", "1 no"},     {"0", "1 no"},     {"2", "misfit"},  {"-1", "misfit"}, {"on", "misfit"}, {"off", "misfit"},
        {"ja", "misfit"},  {"truee", "misfit"}, {"**", "misfit"}, {"1.0", "misfit"}, {"", "none"},
    };
    for (const int type : {VARIABLE_BOOLEAN, VARIABLE_FLAG}) {
        for (const Row &row : rows) {
            EXPECT_EQ(stored(ValueParser(type, id, DataUnits()), row.text), QString::fromUtf8(row.expected))
                << "type " << type << ": " << row.text;
        }
    }
}

TEST(ValueParser, AnEmptyCellStoresNoEntryAndTakesAnEarlierOneAway)
{
    for (int type = -1; type <= 22; ++type) {
        const ValueParser parser(type, id, DataUnits());
        UDictionary object;
        ASSERT_TRUE(parser.store("1", object)) << "type " << type;
        ASSERT_NE(object.Find(id), nullptr) << "type " << type;
        EXPECT_TRUE(parser.store("", object)) << "type " << type;
        EXPECT_EQ(object.Find(id), nullptr) << "type " << type;
    }
}

TEST(ValueParser, NumbersAreMultipliedIntoInternalUnits)
{
    DataUnits feet;
    feet.length = kareport::LengthUnit::InternationalFoot;
    feet.area = kareport::AreaUnit::Acre;
    feet.angle = kareport::AngleUnit::Gon;
    DataUnits dms;
    dms.sexagesimal = true;
    struct Row
    {
        int type;
        DataUnits units;
        const char *text;
        double expected;
        const char *reason;
    };
    const Row rows[] = {
        {VARIABLE_COORDINATE, feet, "10", 10 * 0.3048, "feet"},
        {VARIABLE_STATION, feet, "1+000", 1000 * 0.3048, "a station with its plus in feet"},
        {VARIABLE_AREA, feet, "2", 2 * 4046.8564224, "acres"},
        {VARIABLE_ANGLE, feet, "100", 100 * (std::numbers::pi / 200), "gon"},
        {VARIABLE_BEARING, DataUnits(), "90", 90 * (std::numbers::pi / 180), "degrees"},
        {VARIABLE_DOUBLE, feet, "10", 10, "as given"},
        {VARIABLE_THICKNESS, feet, "10", 10, "as given"},
        {VARIABLE_BEARING, dms, "45-30-0", 45.5 * (std::numbers::pi / 180), "a text of degrees and minutes"},
        {VARIABLE_VANGLE, dms, "-45\xC2\xB0" "30'", -45.5 * (std::numbers::pi / 180), "a text with marks"},
        {VARIABLE_LENGTH, dms, "45", 45, "only angles are such texts"},
        {VARIABLE_COORDINATE, feet, "-INF", -infinite, "infinite in any unit"},
    };
    for (const Row &row : rows) {
        const ValueParser parser(row.type, id, row.units);
        UDictionary object;
        ASSERT_TRUE(parser.store(row.text, object)) << row.reason;
        const UDictEntry *entry = object.Find(id);
        ASSERT_TRUE(entry != nullptr && entry->GetKind() == 8) << row.reason;
        EXPECT_DOUBLE_EQ(*static_cast<const double *>(entry->GetData()), row.expected) << row.reason;
    }
    EXPECT_EQ(stored(ValueParser(VARIABLE_LENGTH, id, dms), "45-30-0"), QStringLiteral("misfit"));
    EXPECT_EQ(stored(ValueParser(VARIABLE_ANGLE, id, DataUnits()), "45-30-0"), QStringLiteral("misfit"))
        << "only where the units say so";
    EXPECT_EQ(stored(ValueParser(VARIABLE_ANGLE, id, dms), "45-60-0"), QStringLiteral("misfit"));
}

TEST(ValueParser, StoresUnderItsIdentifier)
{
    const ValueParser parser(VARIABLE_TEXT, 40000, DataUnits());
    EXPECT_EQ(parser.id(), 40000U);
    UDictionary object;
    ASSERT_TRUE(parser.store("a", object));
    EXPECT_NE(object.Find(40000), nullptr);
    EXPECT_EQ(object.Find(id), nullptr);
}

TEST(ValueParser, SaysWhatWasExpected)
{
    DataUnits dms;
    dms.sexagesimal = true;
    struct Row
    {
        int type;
        DataUnits units;
        const char *contains;
    };
    const Row rows[] = {
        {VARIABLE_INTEGER, {}, "whole number"}, {VARIABLE_DOUBLE, {}, "number"},    {VARIABLE_TEXT, {}, "text"},
        {VARIABLE_STATION, {}, "12+345.678"},   {VARIABLE_BOOLEAN, {}, "yes or no"}, {VARIABLE_FLAG, {}, "yes or no"},
        {VARIABLE_ANGLE, {}, "number"},         {VARIABLE_ANGLE, dms, "45-30-15"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(ValueParser(row.type, id, row.units).expected().contains(QString::fromUtf8(row.contains)))
            << "type " << row.type;
    }
}

} // namespace
