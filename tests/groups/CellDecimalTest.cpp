#include "CellDecimal.h"

#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>
#include <string>

namespace
{

using kareport::CellDecimal;
using kareport::CellReader;

/// A number without zeros at its end, for comparing.
std::string shown(CellDecimal number)
{
    while (number.digits != 0 && number.digits % 10 == 0) {
        number.digits /= 10;
        ++number.exponent;
    }
    return number.digits == 0 ? "0" : std::to_string(number.digits) + 'e' + std::to_string(number.exponent);
}

TEST(CellReader, GivesTheNumberOfTheCellBack)
{
    constexpr double usFoot = 1200.0 / 3937.0;
    constexpr double degree = std::numbers::pi / 180;
    const struct
    {
        double cell;
        double factor;
        const char *number;
        const char *reason;
    } rows[] = {
        {0, 1, "0", "nothing"},
        {-0.0, 1, "0", "nothing below nothing"},
        {0.1, 1, "1e-1", "no double is 0.1"},
        {-12.345, 1, "-12345e-3", "below 0"},
        {1.0005, 1, "10005e-4", "more decimals than the reader begins with"},
        {123456789012345, 1, "123456789012345e0", "15 digits"},
        {0.000123456789012345, 1, "123456789012345e-18", "15 digits after many zeros"},
        {1e300, 1, "1e300", "a large number"},
        {5e-324, 1, "5e-324", "the least number"},
        {0.1 + 0.2, 1, "30000000000000004e-17", "17 digits: the shortest decimal of the double"},
        {0.1, 0.3048, "1e-1", "feet"},
        {-333.333, 0.3048, "-333333e-3", "feet below 0"},
        {12345.67891, usFoot, "1234567891e-5", "US feet"},
        {99999999999.9999, usFoot, "999999999999999e-4", "15 digits in US feet"},
        {45.5042, degree, "455042e-4", "degrees"},
        {0.001, 1e-3, "1e-3", "millimetres"},
        {4.7, 1e6, "47e-1", "square kilometres"},
    };
    for (const auto &row : rows) {
        CellReader reader(row.factor);
        EXPECT_EQ(shown(reader.read(row.cell * row.factor)), row.number) << row.reason;
        EXPECT_EQ(reader.internal(reader.read(row.cell * row.factor).toDouble()), row.cell * row.factor) << row.reason;
    }
}

TEST(CellReader, GivesEveryNumberOfFifteenDigitsBack)
{
    const double factors[] = {1, 0.001, 1000, 0.3048, 1200.0 / 3937.0, 4046.8564224, std::numbers::pi / 200};
    RandomNumbers random(7);
    for (const double factor : factors) {
        CellReader reader(factor);
        for (int i = 0; i < 20'000; ++i) {
            qint64 digits = 0;
            const int count = random.below(15) + 1;
            for (int digit = 0; digit < count; ++digit) {
                digits = digits * 10 + random.below(10);
            }
            const CellDecimal written{random.below(2) == 0 ? digits : -digits, -random.below(12)};
            const double cell = written.toDouble();
            ASSERT_EQ(shown(reader.read(cell * factor)), shown(written)) << factor;
        }
    }
}

TEST(CellReader, GetsUsedToTheDecimalsOfTheNumbers)
{
    CellReader reader;
    CellDecimal number;
    EXPECT_FALSE(reader.readQuickly(0.123456789, number)) << "more decimals than it begins with";
    reader.read(0.123456789);
    EXPECT_TRUE(reader.readQuickly(0.987654321, number));
    EXPECT_EQ(shown(number), "987654321e-9");
    EXPECT_FALSE(reader.readQuickly(1234567890.125, number)) << "too many digits with nine decimals";
    EXPECT_EQ(shown(reader.read(1234567890.125)), "1234567890125e-3");
    EXPECT_TRUE(reader.readQuickly(-1234567891.5, number));
    EXPECT_EQ(shown(number), "-12345678915e-1");
    reader.read(1e20);
    EXPECT_TRUE(reader.readQuickly(12.345, number)) << "a number that is never read quickly changes nothing";
}

TEST(CellReader, CountsDegreesInSeconds)
{
    constexpr double degree = std::numbers::pi / 180;
    const struct
    {
        double cell; ///< as the parts of an angle are added when it is read
        const char *seconds;
        const char *reason;
    } rows[] = {
        {0.0 + 0.0 / 60 + 20.0 / 3600, "2e1", "20 seconds"},
        {45.0 + 30.0 / 60 + 15.5 / 3600, "1638155e-1", "half a second"},
        {-(282.0 + 59.0 / 60 + 47.4123 / 3600), "-10187874123e-4", "four decimals, below 0"},
        {12.0 + 20.2 / 60, "44412e0", "minutes with a decimal"},
        {45.5, "1638e2", "decimal degrees"},
        {45.504305555, "163815499998e-6", "many of them"},
        {180 + (10.0 + 0.0 / 60 + 20.0 / 3600), "68402e1", "S 10 00 20 W"},
        {360 - (77.0 + 13.0 / 60 + 49.0 / 3600), "1017971e0", "N 77 13 49 W"},
        {0, "0", "nothing"},
    };
    for (const auto &row : rows) {
        CellReader reader(degree, CellReader::secondsOfDegree);
        EXPECT_EQ(shown(reader.read(row.cell * degree)), row.seconds) << row.reason;
    }
}

TEST(CellDecimal, IsTheNearestDouble)
{
    EXPECT_EQ((CellDecimal{-7, 400}.toDouble()), -std::numeric_limits<double>::infinity()) << "beyond all of them";
    EXPECT_EQ((CellDecimal{7, -400}.toDouble()), 0.0) << "nearer to 0 than all of them";
    EXPECT_EQ((CellDecimal{1, -1}.toDouble()), 0.1);
    EXPECT_EQ((CellDecimal{-1234567890123456789, -30}.toDouble()), -1234567890123456789e-30);
    EXPECT_EQ((CellDecimal{7, 300}.toDouble()), 7e300);
    EXPECT_EQ((CellDecimal{0, -3}.toDouble()), 0.0);
}

} // namespace
