#include "DataText.h"

#include "UnitFactors.h"

#include <gtest/gtest.h>

#include <charconv>
#include <cmath>
#include <limits>
#include <numbers>
#include <random>

namespace
{

using kareport::appendNumber;
using kareport::appendUtf8;
using kareport::inDataUnit;

std::string textOf(double number, bool isAngle = false)
{
    std::string text;
    appendNumber(text, number, isAngle);
    return text;
}

TEST(DataText, ANumberHasTheFewestDigitsThatSayIt)
{
    struct Row
    {
        double number;
        const char *text;
        const char *reason;
    };
    constexpr Row rows[] = {
        {12.5, "12.5", "decimals as needed"},
        {100000, "100000", "no exponent, though it is shorter"},
        {0.1, "0.1", "not 0.1000000000000000055"},
        {-7, "-7", "a sign"},
        {0, "0", "zero"},
        {-0.0, "-0", "a zero below zero keeps its sign, as some values are printed with it"},
        {0.000001, "0.000001", "the smallest without an exponent"},
        {1e-7, "1e-07", "smaller"},
        {9999999999999998, "9999999999999998", "the largest without an exponent"},
        {1e16, "1e+16", "larger"},
        {1.7976931348623157e308, "1.7976931348623157e+308", "the largest"},
        {5e-324, "5e-324", "the smallest"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(textOf(row.number), row.text) << row.reason;
    }
}

TEST(DataText, AnAngleHasNoExponent)
{
    EXPECT_EQ(textOf(1e-7, true), "0.0000001");
    EXPECT_EQ(textOf(1e16, true), "10000000000000000");
    EXPECT_EQ(textOf(5e-324, true).size(), 2U + 324U) << "the smallest, with all its decimals";
}

TEST(DataText, ANumberOfTheDataIsFoundAgain)
{
    const double factors[] = {1,
                              0.3048,
                              kareport::metresIn(kareport::LengthUnit::UsSurveyFoot),
                              0.001,
                              1000,
                              kareport::squareMetresIn(kareport::AreaUnit::Acre),
                              std::numbers::pi / 180,
                              std::numbers::pi / 200};
    std::mt19937_64 random(20240305);
    for (int i = 0; i < 200'000; ++i) {
        const double factor = factors[i % 8];
        const double scale = std::pow(10.0, static_cast<double>(random() % 12) - 4.0);
        const double read = (static_cast<double>(random() >> 11) / 9007199254740992.0 - 0.5) * scale;
        const double internal = read * factor;
        EXPECT_EQ(inDataUnit(internal, factor) * factor, internal) << read << " by " << factor;
    }
}

TEST(DataText, OfSeveralNumbersItIsTheOneWithTheFewestDigits)
{
    std::mt19937_64 random(7);
    for (int i = 0; i < 20'000; ++i) {
        const double read = static_cast<double>(random() % 100'000'000) / 1000;
        EXPECT_EQ(textOf(inDataUnit(read * 0.3048, 0.3048)), textOf(read)) << "a survey's number of three decimals";
        EXPECT_NE(textOf(inDataUnit(read * std::numbers::pi / 180, std::numbers::pi / 180)), "");
    }
}

TEST(DataText, WhatIsNotFiniteStaysSo)
{
    constexpr double infinity = std::numeric_limits<double>::infinity();
    EXPECT_EQ(inDataUnit(infinity, 0.3048), infinity);
    EXPECT_EQ(inDataUnit(-infinity, 0.3048), -infinity);
    EXPECT_TRUE(std::isnan(inDataUnit(std::nan(""), 0.3048)));
}

TEST(DataText, TextsAreUtf8)
{
    std::string text = "a";
    appendUtf8(text, u"plain");
    appendUtf8(text, QStringView());
    appendUtf8(text, u"\u00e4\u6e2c\U0001d11e");
    EXPECT_EQ(text, "aplain\xC3\xA4\xE6\xB8\xAC\xF0\x9D\x84\x9E");
    text.clear();
    const char16_t half[] = {u'x', 0xD834, u'y'};
    appendUtf8(text, QStringView(half, 3));
    EXPECT_EQ(text, "x\xEF\xBF\xBDy") << "half of a pair";
}

} // namespace
