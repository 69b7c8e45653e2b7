#include "LeadingInteger.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::leadingInteger;

namespace
{

struct NumberRow
{
    const char16_t *text;
    qint32 number;
    const char *reason;
};

constexpr NumberRow numberRows[] = {
    {u"", 0, "nothing"},
    {u"0", 0, "zero"},
    {u"12", 12, "digits"},
    {u"12abc", 12, "up to what is not a digit"},
    {u"12.7", 12, "up to the point, not rounded"},
    {u"1 2", 1, "up to a blank"},
    {u"abc", 0, "no digit at all"},
    {u"a12", 0, "a digit too late"},
    {u"  12", 12, "after blanks"},
    {u"\t\n\r 12", 12, "after white space"},
    {u"-12", -12, "a minus"},
    {u"+12", 12, "a plus"},
    {u" -12", -12, "a minus after a blank"},
    {u"- 12", 0, "a blank after the minus"},
    {u"--12", 0, "two signs"},
    {u"+-12", 0, "two different signs"},
    {u"-", 0, "a sign alone"},
    {u"007", 7, "zeros in front"},
    {u"0x1F", 0, "no hexadecimal numbers"},
    {u"1e3", 1, "no exponents"},
    {u"2147483647", 2147483647, "the largest"},
    {u"2147483648", 2147483647, "one more than the largest"},
    {u"-2147483648", -2147483647 - 1, "the smallest"},
    {u"-2147483649", -2147483647 - 1, "one less than the smallest"},
    {u"99999999999999999999999999", 2147483647, "beyond 64 bits"},
    {u"-99999999999999999999999999", -2147483647 - 1, "beyond 64 bits, negative"},
    {u"00000000000000000000000000000012", 12, "many digits of a small number"},
};

TEST(LeadingInteger, ReadsTheLeadingInteger)
{
    for (const NumberRow &row : numberRows) {
        EXPECT_EQ(leadingInteger(row.text), row.number) << row.reason;
    }
}

} // namespace
