#include "TextSearch.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::TextSearch;

TEST(TextSearch, FindsByCaseAndWholeWord)
{
    struct Row
    {
        const char16_t *line;
        const char16_t *text;
        bool matchCase;
        bool wholeWord;
        qsizetype first;
        qint64 count;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"a", false, false, -1, 0, "an empty line"},
        {u"abc", u"", false, false, -1, 0, "nothing is looked for"},
        {u"abc", u"abcd", false, false, -1, 0, "longer than the line"},
        {u"abcabc", u"abc", false, false, 0, 2, "side by side"},
        {u"aaaa", u"aa", false, false, 0, 2, "matches do not overlap"},
        {u"Point POINT point", u"point", false, false, 0, 3, "in any case"},
        {u"Point POINT point", u"point", true, false, 12, 1, "in this case only"},
        {u"\u00C4hre \u00E4hre", u"\u00E4HRE", false, false, 0, 2, "letters beyond ASCII have cases as well"},
        {u"points point 1point", u"point", false, true, 7, 1, "not as a part of a word"},
        {u"point_1 point-1", u"point", false, true, 8, 1, "an underscore belongs to a word, a hyphen does not"},
        {u"\u6E2Cpoint point\u6E2C", u"point", false, true, -1, 0, "CJK characters are letters"},
        {u"\U00020000point", u"point", false, true, -1, 0, "a letter of two units before it"},
        {u"point\U00020000", u"point", false, true, -1, 0, "and after it"},
        {u"\U0001F600point\U0001F600", u"point", false, true, 2, 1, "a picture is not a letter"},
        {u"\xDC00point", u"point", false, true, 1, 1, "half of a pair is not a letter"},
        {u"a.b axb", u"a.b", false, false, 0, 1, "a dot stands for itself"},
        {u"point point", u"point", false, true, 0, 2, "the first and the last word of a line"},
    };
    for (const Row &row : rows) {
        const QString line = QString::fromUtf16(row.line);
        const TextSearch search(QString::fromUtf16(row.text), row.matchCase, row.wholeWord);
        EXPECT_EQ(search.find(line), row.first) << row.reason;
        EXPECT_EQ(search.count(line), row.count) << row.reason;
    }
}

TEST(TextSearch, TheLastMatchBeforeAPlaceIsOneThatIsCounted)
{
    const TextSearch search(QStringLiteral("aa"), false, false);
    struct Row
    {
        qsizetype before;
        qsizetype expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, -1, "nothing before the line"}, {1, 0, "the first"},       {2, 0, "it begins before the place"},
        {3, 2, "not the one at 1"},         {100, 2, "after the end"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(search.findLast(u"aaaa", row.before), row.expected) << row.reason;
    }
    EXPECT_EQ(TextSearch().findLast(u"a", 1), -1);
    EXPECT_TRUE(TextSearch().isEmpty());
}

} // namespace
