#include "Natural.h"

#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <string>

namespace
{

using kareport::Natural;

TEST(Natural, ShowsItsDigits)
{
    const struct
    {
        const char *digits;
        const char *shown;
        const char *reason;
    } rows[] = {
        {"0", "0", "nothing"},
        {"", "0", "no digit"},
        {"000", "0", "zeros alone"},
        {"7", "7", "one digit"},
        {"999999999", "999999999", "a full limb"},
        {"1000000000", "1000000000", "one more"},
        {"000000000012", "12", "zeros in front"},
        {"12345678901234567890123", "12345678901234567890123", "three limbs"},
        {"1000000000000000005", "1000000000000000005", "a limb of zeros inside"},
    };
    for (const auto &row : rows) {
        EXPECT_EQ(Natural::fromDigits(row.digits).digits(), row.shown) << row.reason;
    }
    EXPECT_EQ(Natural(18'446'744'073'709'551'615U).digits(), "18446744073709551615");
}

TEST(Natural, Calculates)
{
    Natural number = Natural::fromDigits("999999999999999999");
    number.increment();
    EXPECT_EQ(number.digits(), "1000000000000000000") << "the carry goes through all limbs";
    number.multiply(4'294'967'295U);
    EXPECT_EQ(number.digits(), "4294967295000000000000000000");
    EXPECT_FALSE(number.divide(4'294'967'295U));
    EXPECT_TRUE(number.divide(Natural::mostDivisor)) << "2 to the 34th does not divide 10 to the 18th";
    EXPECT_EQ(number.digits(), "58207660");

    Natural product = Natural::fromDigits("123456789012345678901234567890");
    product.multiply(Natural::fromDigits("987654321098765432109876543210"));
    EXPECT_EQ(product.digits(), "121932631137021795226185032733622923332237463801111263526900");
    product.multiply(Natural());
    EXPECT_TRUE(product.isZero());

    Natural power = Natural::fromDigits("1205");
    power.multiplyByPowerOfTen(20);
    EXPECT_EQ(power.digits(), "120500000000000000000000");
    EXPECT_FALSE(power.divideByPowerOfTen(20));
    EXPECT_TRUE(power.divideByPowerOfTen(1)) << "a 5 is left";
    EXPECT_EQ(power.digits(), "120");
    EXPECT_TRUE(power.divideByPowerOfTen(50)) << "more limbs than it has";
    EXPECT_TRUE(power.isZero());
    power.multiplyByPowerOfTen(9);
    EXPECT_TRUE(power.isZero()) << "no limbs of zeros";
}

TEST(Natural, IsWhatPlainNumbersAre)
{
    RandomNumbers random(1);
    for (int i = 0; i < 2000; ++i) {
        const auto one = static_cast<quint64>(random.below(1'000'000'000));
        const auto other = static_cast<quint64>(random.below(1'000'000'000)) + 1;
        Natural product(one);
        product.multiply(static_cast<quint32>(other));
        EXPECT_EQ(product.digits(), std::to_string(one * other));
        EXPECT_EQ(product.isOdd(), one * other % 2 == 1);
        const quint64 divisor = other % 1000 + 1;
        EXPECT_EQ(product.divide(divisor), one * other % divisor != 0);
        EXPECT_EQ(product.digits(), std::to_string(one * other / divisor));
    }
}

} // namespace
