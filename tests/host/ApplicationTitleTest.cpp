#include "ApplicationTitle.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

TEST(ApplicationTitle, MustBeginWithTheWordThatSavedReportsAreKnownBy)
{
    const QString base = QStringLiteral("TALVEN");
    EXPECT_EQ(GetApplicationTitle(), base) << "unless another one was set";
    struct Row
    {
        QStringView title;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"TALVEN Survey", true, "a longer one"},
        {u"TALVENS", true, "longer by one character"},
        {u"TALVEN 測量 😀", true, "characters beyond ASCII"},
        {u"TALVEN", true, "the word itself"},
        {u"", false, "empty"},
        {{}, false, "null"},
        {u"TALVE", false, "cut off"},
        {u"talven Survey", false, "case matters"},
        {u" TALVEN", false, "a blank before it"},
        {u"Survey TALVEN", false, "not at the beginning"},
    };
    for (const Row &row : rows) {
        ASSERT_TRUE(SetApplicationTitle(QStringLiteral("TALVEN before")));
        EXPECT_EQ(SetApplicationTitle(row.title.toString()), row.expected) << row.reason;
        EXPECT_EQ(GetApplicationTitle(), row.expected ? row.title.toString() : QStringLiteral("TALVEN before"))
            << row.reason;
    }
    ASSERT_TRUE(SetApplicationTitle(base));
}

} // namespace
