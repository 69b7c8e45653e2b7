#include "CommaLocale.h"
#include "Notation.h"
#include "NumberText.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <limits>
#include <string>

namespace
{

using kareport::parseNumber;
using kareport::parseSexagesimal;

constexpr double infinite = std::numeric_limits<double>::infinity();

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
        {"-1e-5000", 0, "too small for any type"},
        {"1e-99999999999999999999", 0, "an exponent that is not a number itself"},
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

TEST(ParseNumber, TellsTooSmallFromTooLargeByAllOfTheText)
{
    const std::string zeros(400, '0');
    double number = -1;
    EXPECT_TRUE(parseNumber("0." + zeros + "1", number));
    EXPECT_EQ(number, 0) << "without an exponent";
    EXPECT_TRUE(parseNumber("1" + zeros + "e-800", number));
    EXPECT_EQ(number, 0) << "the exponent makes it smaller than the digits make it larger";
    EXPECT_TRUE(parseNumber("0." + zeros + "1e401", number));
    EXPECT_EQ(number, 1) << "both make up for each other";
    EXPECT_TRUE(parseNumber("-1e-400", number));
    EXPECT_TRUE(std::signbit(number)) << "a sign stays";
    EXPECT_FALSE(parseNumber("0.00001e400", number));
    EXPECT_FALSE(parseNumber("1" + zeros, number));
    EXPECT_FALSE(parseNumber("0." + zeros + "1e900", number));
}

TEST(ParseNumber, RefusesWhatIsNotOne)
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
        {"- 1", "a blank after the sign"},
        {"1,5", "a decimal comma"},
        {"1 000", "a blank inside"},
        {"1.2.3", "two points"},
        {"0x10", "no other base"},
        {"12abc", "letters after it"},
        {"12 m", "a unit after it"},
        {"12+345.678", "a station is not a plain number"},
        {"nan(1)", "what only C writes"},
        {"infinit", "half a word"},
        {"1e400", "out of range"},
        {"-1e400", "out of range below 0"},
        {std::string_view("1\0", 2), "a zero byte after it"},
        {"\xD9\xA1", "digits of another script"},
        {"\xC2\xA0"
         "1",
         "another blank"},
    };
    for (const Row &row : rows) {
        double number = 0;
        EXPECT_FALSE(parseNumber(row.text, number)) << std::string(row.text) << ": " << row.reason;
    }
}

TEST(ParseNumber, DoesNotDependOnTheLanguage)
{
    const CommaLocale comma;
    if (!comma.isThere()) {
        GTEST_SKIP() << "no locale with a decimal comma can be made";
    }
    double usual = 0;
    double tiny = 1;
    const bool read = parseNumber("12.5", usual) && parseNumber("12.5e-400", tiny);
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
        {"45\xC2\xB0"
         "30'15\"",
         angle, "with marks"},
        {"45\xC2\xB0"
         "30'15.5\"",
         angleAndHalf, "with marks and decimals"},
        {"-45-30-15", -angle, "negative: minutes and seconds too"},
        {"-45\xC2\xB0"
         "30'15.5\"",
         -angleAndHalf, "negative with marks"},
        {"-0-30-0", -0.5, "negative with no degrees"},
        {"0-0-0", 0, "nothing"},
        {"0-0-36", 0.01, "seconds only"},
        {"359-59-59.999", 359 + 59.0 / 60 + 59.999 / 3600, "nearly a circle"},
        {"400-0-0", 400, "more than a circle"},
        {"045-05-09", 45 + 5.0 / 60 + 9.0 / 3600, "filled with zeros"},
        {" 45-30-15 ", angle, "blanks around it"},
        {"45-30", 45.5, "without seconds"},
        {"45\xC2\xB0"
         "30'",
         45.5, "without seconds, with marks"},
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

TEST(ParseSexagesimal, RefusesWhatIsNotOne)
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
        {"45-30-15\"x", "something after it"},
        {"45'30\"", "minutes without degrees in front"},
        {"45\xC2\xB0"
         "30\"",
         "the mark of seconds after minutes"},
        {"45 30 15", "blanks between"},
        {"45:30:15", "colons between"},
        {"45\xB0"
         "30'15\"",
         "a mark in Latin-1"},
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

} // namespace
