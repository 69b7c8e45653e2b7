#include "VariableKeywords.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::keywordOf;
using kareport::variableTypeFromKeyword;

namespace
{

struct Row
{
    const char16_t *keyword;
    int code;
};

constexpr Row rows[] = {
    {u"INTEGER", 0}, {u"DOUBLE", 1},   {u"TEXT", 2},      {u"ANGLE", 3},    {u"BEARING", 4}, {u"COORDINATE", 5},
    {u"LENGTH", 6},  {u"DISTANCE", 7}, {u"ELEVATION", 8}, {u"STATION", 9},  {u"OFFSET", 10}, {u"AREA", 11},
    {u"NAME", 16},   {u"NUMBER", 17},  {u"VANGLE", 18},   {u"BOOLEAN", 19}, {u"FLAG", 20},   {u"THICKNESS", 22},
};

TEST(VariableType, EveryKeywordHasItsCodeInAnyCase)
{
    for (const Row &row : rows) {
        const QString keyword = QString::fromUtf16(row.keyword);
        const QString mixed = keyword.first(1) + keyword.sliced(1).toLower();
        for (const QString &spelling : {keyword, keyword.toLower(), mixed}) {
            const auto type = variableTypeFromKeyword(spelling);
            ASSERT_TRUE(type) << spelling.toStdString();
            EXPECT_EQ(static_cast<int>(*type), row.code) << spelling.toStdString();
        }
        EXPECT_EQ(keywordOf(row.code).toString(), keyword);
    }
}

TEST(VariableType, ThicknessIsTwentyTwoAndRadiusIsUnknown)
{
    EXPECT_EQ(variableTypeFromKeyword(u"Thickness"), VARIABLE_THICKNESS);
    EXPECT_EQ(static_cast<int>(VARIABLE_THICKNESS), 22);
    EXPECT_FALSE(variableTypeFromKeyword(u"Radius"));
}

TEST(VariableType, CodesWithoutAKeywordHaveNone)
{
    for (const int code : {-1, 12, 13, 14, 15, 21, 23, 1000}) {
        EXPECT_TRUE(keywordOf(code).isEmpty()) << code;
    }
}

TEST(VariableType, OtherTextsAreNotKeywords)
{
    constexpr struct
    {
        const char16_t *text;
        const char *reason;
    } others[] = {
        {u"", "nothing"},
        {u" LENGTH", "a blank in front: values are not trimmed"},
        {u"LENGTH ", "a blank after it"},
        {u"LENGT", "too short"},
        {u"LENGTHS", "too long"},
        {u"6", "a code is not a keyword"},
        {u"PLAIN", "the type without a keyword"},
        {u"İNTEGER", "a capital I with a dot does not fold to an I"},
    };
    for (const auto &other : others) {
        EXPECT_FALSE(variableTypeFromKeyword(other.text)) << other.reason;
    }
}

} // namespace
