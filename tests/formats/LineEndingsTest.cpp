#include "LineEndings.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

TEST(LineEndings, EveryLineFeedHasAReturnBeforeIt)
{
    struct Row
    {
        QString text;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), QString(), "nothing"},
        {QStringLiteral("\n"), QStringLiteral("\r\n"), "the first character"},
        {QStringLiteral("a\r\nb\nc"), QStringLiteral("a\r\nb\r\nc"), "one that has it, one that has not"},
        {QStringLiteral("\n\n\r\n\r"), QStringLiteral("\r\n\r\n\r\n\r"), "runs, and a CR alone"},
        {QStringLiteral("\r\r\n"), QStringLiteral("\r\r\n"), "two CR"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::withCrLf(row.text), row.expected) << row.reason;
    }
}

} // namespace
