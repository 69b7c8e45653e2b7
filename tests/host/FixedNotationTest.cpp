#include "FixedNotation.h"

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdio>
#include <limits>
#include <random>

namespace
{

std::string printed(double value, int decimals)
{
    const int size = std::snprintf(nullptr, 0, "%.*f", decimals, value);
    std::string text(static_cast<std::size_t>(size) + 1, '\0');
    std::snprintf(text.data(), text.size(), "%.*f", decimals, value);
    text.pop_back();
    return text;
}

struct Row
{
    double value;
    int decimals;
    const char *expected;
    const char *reason;
};

constexpr Row rows[] = {
    {0.0, 3, "0.000", "zero"},
    {0.0, 0, "0", "no decimals, no point"},
    {-1.5, 1, "1.5", "the sign is the caller's"},
    {0.5, 0, "0", "an exact tie goes to the even digit below"},
    {1.5, 0, "2", "an exact tie goes to the even digit above"},
    {2.5, 0, "2", "an exact tie goes to the even digit below"},
    {0.125, 2, "0.12", "an exact tie in the decimals"},
    {0.375, 2, "0.38", "an exact tie in the decimals, odd below"},
    {1.005, 2, "1.00", "the double is a little below the tie it is written as"},
    {2.675, 2, "2.67", "the double is a little below the tie it is written as"},
    {1.0000000000000002, 15, "1.000000000000000", "the last bit rounds down"},
    {0.9995, 3, "1.000", "the double is a little above the tie; carries through all nines"},
    {1e-320, 3, "0.000", "a number without full precision"},
    {123, -4, "123", "decimals below 0 count as 0"},
    {1e22, 2, "10000000000000000000000.00", "beyond 64 bits"},
    {0.1, 20, "0.10000000000000000555", "more decimals than a power of ten is exact"},
};

TEST(FixedNotation, WritesDigitsAsPrintfDoes)
{
    for (const Row &row : rows) {
        const kareport::FixedNotation fixed(row.value, row.decimals);
        EXPECT_EQ(fixed.digits(), row.expected) << row.reason;
        EXPECT_EQ(fixed.isZero(), std::string_view(row.expected).find_first_not_of("0.") == std::string_view::npos)
            << row.reason;
    }
}

TEST(FixedNotation, AgreesWithPrintfOnEveryKindOfNumber)
{
    std::mt19937_64 random(20240305);
    for (int i = 0; i < 200000; ++i) {
        const int decimals = static_cast<int>(random() % 18);
        double value = 0;
        switch (i % 4) {
        case 0: value = std::bit_cast<double>(random()); break;                          // any bit pattern
        case 1: value = static_cast<double>(random() % 100000000) / 1000.0; break;       // what surveyors have
        case 2: value = (static_cast<double>(random() % 2000000) + 0.5) / 1024.0; break; // many exact ties
        default: value = std::ldexp(static_cast<double>(random() >> 11), -static_cast<int>(random() % 80)); break;
        }
        if (!std::isfinite(value)) {
            continue;
        }
        ASSERT_EQ(kareport::FixedNotation(value, decimals).digits(), printed(std::fabs(value), decimals))
            << value << " with " << decimals;
    }
}

TEST(FixedNotation, WritesTheLargestNumberAndManyDecimals)
{
    const double largest = std::numeric_limits<double>::max();
    EXPECT_EQ(kareport::FixedNotation(largest, 3).digits(), printed(largest, 3));
    EXPECT_EQ(kareport::FixedNotation(0.1, 2000).digits(), printed(0.1, 2000));
}

} // namespace
