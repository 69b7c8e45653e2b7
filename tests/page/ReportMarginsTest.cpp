#include "ReportMargins.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::marginsFromText;
using kareport::marginsToText;

constexpr QMargins usual(1000, 1100, 1200, 2000);

TEST(ReportMargins, ReadsNumbersInTheOrderLeftTopRightBottom)
{
    struct Row
    {
        const char16_t *text;
        const char16_t *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"1, 2, 3, 4", u"1, 2, 3, 4", "as it is written"},
        {u"1,2,3,4", u"1, 2, 3, 4", "commas alone"},
        {u"1 2 3 4", u"1, 2, 3, 4", "blanks alone"},
        {u",, 1 ,, , 2  3,4 ,", u"1, 2, 3, 4", "empty pieces do not count"},
        {u"100, 200", u"100, 200, 1200, 2000", "two numbers set left and top only"},
        {u"5", u"5, 1100, 1200, 2000", "one number sets left only"},
        {u"1, 2, 3", u"1, 2, 3, 2000", "bottom stays"},
        {u"abc", u"0, 1100, 1200, 2000", "letters only set left to 0"},
        {u"x, 7", u"0, 7, 1200, 2000", "a piece without a number counts as 0, the next is read"},
        {u"", u"1000, 1100, 1200, 2000", "nothing changes nothing"},
        {u" , , ", u"1000, 1100, 1200, 2000", "delimiters only change nothing"},
        {u"1, 2, 3, 4, 5", u"1, 2, 3, 4", "a fifth number is not read"},
        {u"-5, +6, -0, 007", u"-5, 6, 0, 7", "signs and leading zeros; no range is checked"},
        {u"12mm, 3.9, 4e2, 0x10", u"12, 3, 4, 0", "a number ends at the first other character"},
        {u"- 5", u"0, 5, 1200, 2000", "a sign alone is a piece without a number"},
        {u"1;2, 3", u"1, 3, 1200, 2000", "a semicolon does not delimit"},
        {u"99999999999, -99999999999", u"2147483647, -2147483648, 1200, 2000", "outside 32 bits: the nearest"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(marginsToText(marginsFromText(QString::fromUtf16(row.text), usual)), QString::fromUtf16(row.expected))
            << row.reason;
    }
}

TEST(ReportMargins, WritesNumbersInTheOrderLeftTopRightBottom)
{
    EXPECT_EQ(marginsToText(QMargins(1000, 1001, 1200, 2000)), QStringLiteral("1000, 1001, 1200, 2000"));
    EXPECT_EQ(marginsToText(QMargins()), QStringLiteral("0, 0, 0, 0"));
    EXPECT_EQ(marginsToText(QMargins(-1, 2147483647, -2147483647 - 1, 0)),
              QStringLiteral("-1, 2147483647, -2147483648, 0"));
}

TEST(ReportMargins, ReadsBackEachMarginIntoItsPlace)
{
    const QMargins read = marginsFromText(QStringLiteral("1, 2, 3, 4"), usual);
    EXPECT_EQ(read.left(), 1);
    EXPECT_EQ(read.top(), 2);
    EXPECT_EQ(read.right(), 3);
    EXPECT_EQ(read.bottom(), 4);
}

} // namespace
