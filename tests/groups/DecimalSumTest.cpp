#include "DecimalSum.h"

#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace
{

using kareport::CellDecimal;
using kareport::CellReader;
using kareport::DecimalSum;
using kareport::UnitRatio;

/// A sum with so many decimals.
std::string shown(const DecimalSum &sum, int decimals)
{
    const auto rounded = sum.exact().rounded(UnitRatio(), 1, decimals);
    return (rounded.isNegative ? "-" : "") + rounded.digits;
}

TEST(DecimalSum, IsExact)
{
    struct Row
    {
        std::vector<double> cells;
        int decimals;
        const char *sum;
        const char *reason;
    };
    const Row rows[] = {
        {{}, 3, "0.000", "nothing"},
        {{0.1, 0.2}, 17, "0.30000000000000000", "the sum of the doubles is another number"},
        {{0.1, 0.1, 0.1, 0.1, 0.1, 0.1, 0.1, 0.1, 0.1, 0.1}, 20, "1.00000000000000000000", "ten tenths"},
        {{1e300, 1, -1e300}, 1, "1.0", "what is far smaller stays"},
        {{1e15, 1e-15}, 15, "1000000000000000.000000000000001", "31 digits"},
        {{5e-324, 1}, 2, "1.00", "the least number"},
        {{-0.5, 0.25}, 2, "-0.25", "below 0"},
        {{0.5, -0.5}, 1, "0.0", "nothing is left, without a sign"},
        {{1e18, 1e18, 1e18, 1e18, 1e18, 1e18, 1e18, 1e18, 1e18, 1e18}, 0, "10000000000000000000", "over 64 bits"},
        {{-1e18, -8e18, -9e18}, 0, "-18000000000000000000", "the same below 0"},
        {{1.7976931348623157e308, 1.7976931348623157e308}, 0, nullptr, "beyond the largest double"},
    };
    for (const Row &row : rows) {
        DecimalSum sum;
        CellReader reader;
        for (const double cell : row.cells) {
            sum.add(reader.read(cell));
        }
        if (row.sum != nullptr) {
            EXPECT_EQ(shown(sum, row.decimals), row.sum) << row.reason;
        } else {
            EXPECT_EQ(shown(sum, 0).substr(0, 17), "35953862697246314") << row.reason;
        }
    }
}

TEST(DecimalSum, AddsDigitsAndSums)
{
    DecimalSum sum;
    sum.add(false, "123456789012345678901234567890.123456789012345");
    sum.add(true, "0.000000000000005");
    sum.add(true, "890");
    EXPECT_EQ(shown(sum, 15), "123456789012345678901234567000.123456789012340");
    DecimalSum other;
    other.add(CellDecimal{5, -3});
    other.add(sum);
    EXPECT_EQ(shown(other, 15), "123456789012345678901234567000.128456789012340");
    other.clear();
    EXPECT_EQ(shown(other, 3), "0.000");
    other.add(CellDecimal{25, -1});
    EXPECT_EQ(shown(other, 3), "2.500") << "nothing is left of what was cleared";
    EXPECT_EQ(other.toDouble(), 2.5);
    EXPECT_EQ(sum.toDouble(), 1.2345678901234568e29);
}

TEST(DecimalSum, IsThatOfLongNumbers)
{
    RandomNumbers random(3);
    for (int run = 0; run < 300; ++run) {
        DecimalSum sum;
        DecimalSum parts;
        qint64 model = 0; // in millionths
        const int count = random.below(50);
        for (int i = 0; i < count; ++i) {
            const int decimals = random.below(7);
            qint64 unit = 1;
            for (int digit = decimals; digit < 6; ++digit) {
                unit *= 10;
            }
            const qint64 digits = random.below(2'000'000'000) - 1'000'000'000;
            sum.add(CellDecimal{digits, -decimals});
            DecimalSum part;
            part.add(CellDecimal{digits, -decimals});
            parts.add(part);
            model += digits * unit;
        }
        std::string expected = std::to_string(model < 0 ? -model : model);
        expected.insert(0, expected.size() < 7 ? 7 - expected.size() : 0, '0');
        expected.insert(expected.size() - 6, ".");
        expected.insert(0, model < 0 ? "-" : "");
        ASSERT_EQ(shown(sum, 6), expected) << run;
        ASSERT_EQ(shown(parts, 6), expected) << run;
    }
}

} // namespace
