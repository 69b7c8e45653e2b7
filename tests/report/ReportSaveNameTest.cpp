#include "ReportSaveName.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

TEST(ReportSaveName, TheExtensionCountsOnlyAtTheEndAndOnlyTheFirstTime)
{
    struct Row
    {
        QStringView name;
        QStringView extension;
        bool expected;
        const char *reason;
    };
    const Row rows[] = {
        {u"a.rtf", u".rtf", true, "the usual name"},
        {u"x.RTF", u".rtf", true, "case does not matter"},
        {u"x.RtF", u".rtf", true, "case does not matter"},
        {u"a.pdf", u".pdf", true, "the usual name"},
        {u"a.pdf", u".rtf", false, "another extension"},
        {u"x.rtf.rep", u".rtf", false, "earlier only"},
        {u"x.rtf.rtf", u".rtf", false, "the first one is not at the end"},
        {u"x.RTF.rtf", u".rtf", false, "the first one is not at the end, in any case"},
        {u"/plans.rtf/a.rtf", u".rtf", false, "a folder that holds the extension counts as earlier"},
        {u"a.rtf.pdf", u".pdf", true, "another extension earlier does no harm"},
        {u"a.rtf ", u".rtf", false, "a blank after it"},
        {u"a.rt", u".rtf", false, "cut off"},
        {u"artf", u".rtf", false, "without its point"},
        {u".rtf", u".rtf", true, "the extension alone"},
        {u"rtf", u".rtf", false, "one character shorter than the extension"},
        {u"", u".rtf", false, "empty"},
        {u"測量.rtf", u".rtf", true, "characters beyond Latin-1"},
        {u"\xD83D\xDE00.rtf", u".rtf", true, "a surrogate pair in front"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::endsWithExtension(row.name, row.extension), row.expected)
            << row.reason << ": " << testing::PrintToString(row.name);
    }
}

TEST(ReportSaveName, TheNameSaysWhatIsSaved)
{
    struct Row
    {
        QStringView name;
        bool isRichText;
        bool isPdf;
    };
    const Row rows[] = {
        {u"a.rep", false, false},    {u"a.rtf", true, false},      {u"a.PDF", false, true},
        {u"a.pdf.rtf", true, false}, {u"a.pdf.pdf", false, false}, {u"/plans.pdf/a.pdf", false, false},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::isRichTextName(row.name), row.isRichText) << testing::PrintToString(row.name);
        EXPECT_EQ(kareport::isPdfName(row.name), row.isPdf) << testing::PrintToString(row.name);
    }
}

} // namespace
