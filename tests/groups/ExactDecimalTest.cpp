#include "ExactDecimal.h"

#include <gtest/gtest.h>

namespace
{

using kareport::ExactDecimal;
using kareport::Natural;
using kareport::UnitRatio;

TEST(ExactDecimal, IsRoundedOnce)
{
    const UnitRatio none;
    const UnitRatio usFeet{{3937}, {1200}, 0};
    const UnitRatio acres{{100'000'000}, {43'560, 9'290'304}, 0};
    const UnitRatio degreesOfRadians{{360}, {2}, -1};
    const UnitRatio radiansOfDegrees{{2}, {360}, 1};
    const struct
    {
        bool isNegative;
        const char *digits;
        int decimals;
        UnitRatio ratio;
        quint64 divisor;
        int shown;
        const char *text;
        const char *reason;
    } rows[] = {
        {false, "12345", 3, none, 1, 3, "12.345", "as it is"},
        {false, "12345", 3, none, 1, 5, "12.34500", "more decimals"},
        {false, "12345", 3, none, 1, 2, "12.34", "a tie goes to the even digit: down"},
        {false, "12355", 3, none, 1, 2, "12.36", "up"},
        {false, "1234500000000000000000000000001", 29, none, 1, 2, "12.35", "just above a tie"},
        {true, "12355", 3, none, 1, 2, "12.36", "the sign has no part in it"},
        {false, "5", 1, none, 1, 0, "0", "a half of one"},
        {false, "15", 1, none, 1, 0, "2", "one and a half"},
        {false, "9995", 3, none, 1, 2, "10.00", "a carry through all digits"},
        {false, "1", 3, none, 1, 2, "0.00", "less than is shown"},
        {false, "10", 0, none, 3, 3, "3.333", "a mean"},
        {false, "20", 0, none, 3, 3, "6.667", "a mean, up"},
        {false, "1", 0, none, 8, 2, "0.12", "a mean that is a tie"},
        {false, "1000", 0, usFeet, 1, 6, "3280.833333", "metres in US feet"},
        {false, "1200", 0, usFeet, 1, 10, "3937.0000000000", "without a rest"},
        {false, "40468564224", 7, acres, 1, 9, "1.000000000", "one acre"},
        {false, "314159265358979323846264338327950288", 35, degreesOfRadians, 1, 15, "180.000000000000000",
         "half a circle"},
        {false, "180", 0, radiansOfDegrees, 1, 30, "3.141592653589793238462643383280", "the same from degrees"},
        {false, "0", 0, usFeet, 7, 2, "0.00", "nothing"},
        {false, "12", 0, none, 1, -3, "12", "no decimals below 0"},
    };
    for (const auto &row : rows) {
        const ExactDecimal number(row.isNegative, Natural::fromDigits(row.digits), row.decimals);
        const auto rounded = number.rounded(row.ratio, row.divisor, row.shown);
        EXPECT_EQ(rounded.digits, row.text) << row.reason;
        EXPECT_EQ(rounded.isNegative, row.isNegative) << row.reason;
        EXPECT_EQ(rounded.isZero, number.isZero()) << row.reason;
    }
}

TEST(ExactDecimal, SaysWhetherADoubleHoldsIt)
{
    const auto fits = [](const char *digits, int decimals) {
        return ExactDecimal(false, Natural::fromDigits(digits), decimals)
            .rounded(UnitRatio(), 1, decimals)
            .fitsDouble();
    };
    EXPECT_TRUE(fits("123456789012345", 3));
    EXPECT_FALSE(fits("1234567890123456", 3));
    EXPECT_TRUE(fits("0", 15)) << "zeros alone";
    EXPECT_TRUE(fits("1", 15)) << "zeros in front do not count";
    EXPECT_EQ(ExactDecimal(true, Natural(25), 1).toDouble(), -2.5);
}

} // namespace
