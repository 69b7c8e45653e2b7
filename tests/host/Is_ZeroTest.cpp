#include "Is_Zero.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

TEST(Is_Zero, BelowABillionthOnEitherSide)
{
    constexpr double infinite = std::numeric_limits<double>::infinity();
    struct Row
    {
        double value;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0.0, true, "zero"},
        {-0.0, true, "zero with a sign"},
        {9.99e-10, true, "just below"},
        {-9.99e-10, true, "just below, negative"},
        {1e-9, false, "the bound itself does not count as zero"},
        {-1e-9, false, "the bound itself, negative"},
        {1.01e-9, false, "just above"},
        {std::numeric_limits<double>::denorm_min(), true, "the smallest number there is"},
        {infinite, false, "infinite"},
        {-infinite, false, "infinite, negative"},
        {std::numeric_limits<double>::quiet_NaN(), false, "not a number is not zero either"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(Is_Zero(row.value), row.expected) << row.reason;
    }
}

} // namespace
