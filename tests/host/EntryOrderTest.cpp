#include "EntryOrder.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using kareport::compareEntries;
using kareport::numberOf;

UDictEntry entry(UDictEntry::Value value)
{
    return {1, std::move(value)};
}

TEST(EntryOrder, ANumberIsOneWhateverItsSize)
{
    struct Row
    {
        UDictEntry::Value value;
        std::optional<double> expected;
        const char *reason;
    };
    const Row rows[] = {
        {qint16(-7), -7.0, "16 bits"},
        {std::numeric_limits<qint32>::max(), 2147483647.0, "32 bits"},
        {0.25, 0.25, "with decimals"},
        {true, std::nullopt, "a truth is not a number to add up or to compare with a limit"},
        {QStringLiteral("7"), std::nullopt, "a text"},
        {UPointNumber(QStringLiteral("7")), std::nullopt, "the number of a point is a text"},
    };
    for (const Row &row : rows) {
        const UDictEntry held = entry(row.value);
        EXPECT_EQ(numberOf(&held), row.expected) << row.reason;
    }
    EXPECT_EQ(numberOf(nullptr), std::nullopt);
}

TEST(EntryOrder, TrueAndFalseSortAsOneAndZero)
{
    const UDictEntry yes = entry(true);
    const UDictEntry no = entry(false);
    const UDictEntry one = entry(qint16(1));
    const UDictEntry half = entry(0.5);
    EXPECT_TRUE(std::is_eq(compareEntries(&yes, &one)));
    EXPECT_TRUE(std::is_lt(compareEntries(&no, &half)));
    EXPECT_TRUE(std::is_gt(compareEntries(&yes, &half)));
}

} // namespace
