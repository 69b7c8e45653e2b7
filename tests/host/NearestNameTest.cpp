#include "NearestName.h"

#include <gtest/gtest.h>

namespace
{

using kareport::didYouMean;
using kareport::nearestName;
using kareport::shortened;

TEST(NearestName, FindsWhatWasProbablyMeant)
{
    const QStringList known = {"Number", "Northing", "Easting", "Elevation", "Description", "Dx", "Dy"};
    struct Row
    {
        const char *misspelt;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Elev", "Elevation", "its beginning"},
        {"elev", "Elevation", "its beginning in another case"},
        {"Elevations", "Elevation", "a letter too many"},
        {"Elevatoin", "Elevation", "two letters exchanged"},
        {"Nothing", "Northing", "a letter is missing"},
        {"Nortking", "Northing", "a wrong letter"},
        {"EASTNIG", "Easting", "in capitals"},
        {"Descr", "Description", "its beginning"},
        {"DX1", "Dx", "a letter too many after a short name"},
        {"Dz", "Dx", "of names equally near, the first"},
        {"El", "", "a beginning of two letters is too short"},
        {"Zzz", "", "nothing is near"},
        {"", "", "nothing"},
        {"Q", "", "all letters would be wrong"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(nearestName(QString::fromUtf8(row.misspelt), known).toStdString(), row.expected)
            << row.misspelt << ": " << row.reason;
    }
    EXPECT_TRUE(nearestName(u"Elev", {}).isEmpty());
    EXPECT_FALSE(nearestName(QString(100000, u'x'), {QString(100000, u'x') + u'y'}).isEmpty()) << "long names, soon";
}

TEST(NearestName, Asks)
{
    EXPECT_EQ(didYouMean(u"Elev", {"Elevation"}).toStdString(), "did you mean \"Elevation\"?");
    EXPECT_EQ(didYouMean(u"Zzz", {"Elevation"}).toStdString(), "");
}

TEST(NearestName, SaysWhatWouldHaveBeenRight)
{
    using kareport::oneOfExpected;
    EXPECT_EQ(oneOfExpected(u"usfeet", {"m", "ft"}).toStdString(), "one of m, ft was expected");
    EXPECT_EQ(oneOfExpected(u"utf8", {"utf-8", "latin-1"}).toStdString(),
              "one of utf-8, latin-1 was expected; did you mean \"utf-8\"?");
    EXPECT_EQ(oneOfExpected(u"a", {}).toStdString(), "one of none was expected");
    QStringList many;
    for (int i = 0; i < 41; ++i) {
        many.append(QStringLiteral("name%1").arg(i));
    }
    EXPECT_TRUE(oneOfExpected(u"other", many).endsWith(u"name39, … was expected")) << "not all of very many";
    EXPECT_EQ(kareport::withQuestion(QStringLiteral("wrong"), u"Elev", {"Elevation"}).toStdString(),
              "wrong: did you mean \"Elevation\"?");
    EXPECT_EQ(kareport::withQuestion(QStringLiteral("wrong"), u"Zzz", {"Elevation"}).toStdString(), "wrong");
}

TEST(NearestName, TextsAreShortenedBetweenCharacters)
{
    EXPECT_EQ(shortened(QStringLiteral("abc"), 3), u"abc");
    EXPECT_EQ(shortened(QStringLiteral("abcd"), 3), u"abc…");
    EXPECT_EQ(shortened(QStringLiteral("ab\U0001F600d"), 3), u"ab…") << "half a character is none";
    EXPECT_EQ(shortened(QStringLiteral("ab\U0001F600d"), 4), u"ab\U0001F600…");
    EXPECT_EQ(shortened(QString(), 0), u"");
}

TEST(NearestName, WhatWouldHaveBeenRightFollowsASentence)
{
    using kareport::withExpected;
    EXPECT_EQ(withExpected(QStringLiteral("wrong"), u"Elev", {"Elevation"}), u"wrong: did you mean \"Elevation\"?");
    EXPECT_EQ(withExpected(QStringLiteral("wrong"), u"Zzz", {"Elevation"}), u"wrong: one of Elevation was expected");
    EXPECT_EQ(withExpected(QStringLiteral("wrong"), u"Zzz", {}), u"wrong");
}

} // namespace
