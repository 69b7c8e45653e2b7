#include "ReportResources.h"

#include <gtest/gtest.h>

namespace
{

TEST(ReportResources, TextsAreKnownByTheirNumbers)
{
    struct Row
    {
        unsigned number;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {11001, "KaReport", "the window's title"},
        {11007, "Save", "a button"},
        {11009, "View\\Edit Report", "a button; one backslash"},
        {11011, "Print", "a button"},
        {11018, "", "the toolbar has no text"},
        {11008, "", "between two buttons"},
        {0, "", "no number"},
        {0xFFFFFFFF, "", "no number"},
    };
    for (const Row &row : rows) {
        EXPECT_STREQ(kareport::reportString(row.number), row.expected) << row.reason;
    }
}

} // namespace
