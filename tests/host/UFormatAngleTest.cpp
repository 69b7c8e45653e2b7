#include "UFormatAngle.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

TEST(UFormatAngle, EveryMarkIsReplacedOnce)
{
    struct Row
    {
        char degreeMark;
        char minuteMark;
        char secondMark;
        QStringView text;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {'d', 'm', 's', u"", u"", "empty"},
        {'d', 'm', 's', {}, u"", "null"},
        {'d', 'm', 's', u"12345", u"12345", "no marks"},
        {'d', 'm', 's', u"45°06'07\"", u"45d06m07s", "one each"},
        {'\xB0', '\'', '"', u"45°06'07\"", u"45°06'07\"", "the usual marks change nothing"},
        {'d', 'm', 's', u"°°''\"\"°", u"ddmmssd", "every one, in any order"},
        {'d', 'm', 's', u"N 45°06'07\" E, S 1°", u"N 45d06m07s E, S 1d", "several angles"},
        {'\'', '"', '\xB0', u"45°06'07\"", u"45'06\"07°", "a new mark is not taken for another one"},
        {'"', '"', '"', u"°'\"", u"\"\"\"", "all the same"},
        {'\xB0', '\xB0', '\xB0', u"°'\"", u"°°°", "all the first one"},
        {'\0', 'm', 's', u"45°06'07\"", u"4506m07s", "the character 0 removes the degree mark"},
        {'d', '\0', 's', u"45°06'07\"", u"45d0607s", "the character 0 removes the minute mark"},
        {'d', 'm', '\0', u"45°06'07\"", u"45d06m07", "the character 0 removes the second mark"},
        {'\0', '\0', '\0', u"45°06'07\"", u"450607", "all removed"},
        {'\0', '\0', '\0', u"°'\"", u"", "nothing is left"},
        {'\xFF', '\x80', '\xE9', u"°'\"", u"ÿ\u0080é", "marks above 127 are Latin-1"},
        {'d', 'm', 's', u"º′″’”", u"º′″’”", "what only looks like a mark stays"},
        {'d', 'm', 's', QStringView(u"角𝛼°\0'x\"", 8), QStringView(u"角𝛼d\0mxs", 8),
         "other characters stay, a 0 among them"},
    };
    for (const Row &row : rows) {
        QString text = row.text.toString();
        UFormatAngle::ConvertToDMSformatString(row.degreeMark, row.minuteMark, row.secondMark, text);
        EXPECT_EQ(text, row.expected.toString()) << row.reason;
    }
}

TEST(UFormatAngle, ChangesNoOtherCopyOfTheText)
{
    const QString original = QStringLiteral("1°");
    QString text = original;
    UFormatAngle::ConvertToDMSformatString('d', 'm', 's', text);
    EXPECT_EQ(text, QStringLiteral("1d"));
    EXPECT_EQ(original, QStringLiteral("1°"));
}

} // namespace
