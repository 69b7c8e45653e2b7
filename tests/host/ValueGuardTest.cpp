#include "ValueGuard.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

using kareport::ValueGuard;

namespace
{

TEST(ValueGuard, SetsAndGivesBackWhatWasThere)
{
    std::vector<int> set;
    {
        const ValueGuard guard(7, 1, [&set](int value) { set.push_back(value); });
        EXPECT_EQ(set, std::vector<int>({1}));
    }
    EXPECT_EQ(set, std::vector<int>({1, 7}));
}

TEST(ValueGuard, GivesItBackAlsoWhereTheWorkThrows)
{
    bool isOn = true;
    const auto work = [&isOn] {
        const ValueGuard guard(isOn, false, [&isOn](bool on) { isOn = on; });
        throw std::runtime_error("ends here");
    };
    EXPECT_THROW(work(), std::runtime_error);
    EXPECT_TRUE(isOn);
}

TEST(ValueGuard, OneWithinAnotherGivesBackWhatTheOuterOneHasSet)
{
    int value = 1;
    const auto set = [&value](int to) { value = to; };
    {
        const ValueGuard outer(value, 2, set);
        {
            const ValueGuard inner(value, 3, set);
            EXPECT_EQ(value, 3);
        }
        EXPECT_EQ(value, 2);
    }
    EXPECT_EQ(value, 1);
}

} // namespace
