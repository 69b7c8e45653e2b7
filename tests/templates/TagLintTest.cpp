#include "TagLint.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::elementName;
using kareport::findIgnoredTags;
using kareport::ScanText;
using kareport::TagRemark;

namespace
{

using Kind = TagRemark::Kind;

struct Row
{
    const char16_t *text;
    Kind kind;
    qsizetype source; ///< -1: nothing to remark
    const char16_t *quote;
    const char *reason;
};

constexpr Row rows[] = {
    {u"", Kind::NotATag, -1, u"", "nothing"},
    {u"<Name>A</Name>", Kind::NotATag, -1, u"", "two tags"},
    {u"<name>A</NAME>", Kind::NotATag, -1, u"", "two tags in any case"},
    {u"<Name>A</>", Kind::NotATag, -1, u"", "the short closing tag"},
    {u"a < b, b > a, 1 <2> 3", Kind::NotATag, -1, u"", "signs that are not tags"},
    {u"<?xml version=\"1.0\"?>", Kind::NotATag, -1, u"", "a declaration"},
    {u"<Templates a=\"1\">", Kind::NotATag, -1, u"", "an element of another name"},
    {u"<Names >", Kind::NotATag, -1, u"", "a longer name"},
    {u"<VariableName >", Kind::NotATag, 0, u"<VariableName >", "the longest of two names that fit"},
    {u"x<Name >A</Name>", Kind::NotATag, 1, u"<Name >", "a blank after the name"},
    {u"< Name>A</Name>", Kind::NotATag, 0, u"< Name>", "a blank before the name"},
    {u"<Name a=\"1\">A</Name>", Kind::NotATag, 0, u"<Name a=\"1\">", "an attribute"},
    {u"<Name>A</Name >", Kind::NotATag, 7, u"</Name >", "a blank in the closing tag"},
    {u"<Name>A</ Name>", Kind::NotATag, 7, u"</ Name>", "a blank after the slash"},
    {u"<Name>A< /Name>", Kind::NotATag, 7, u"< /Name>", "a blank before the slash"},
    {u"<Name/>", Kind::NotATag, 0, u"<Name/>", "an element without content, as a parser would read it"},
    {u"<name />", Kind::NotATag, 0, u"<name />", "the same with a blank, in any case"},
    {u"<<Name >", Kind::NotATag, 1, u"<Name >", "the innermost of two signs"},
    {u"<Name \n", Kind::NotATag, -1, u"", "cut off in the middle"},
    {u"<Name <Title>", Kind::NotATag, -1, u"", "a sign that no other closes"},
    {u"<", Kind::NotATag, -1, u"", "a sign at the end"},
    {u"<>", Kind::NotATag, -1, u"", "no name"},
    {u"<!-- a comment -->", Kind::InComment, -1, u"", "a comment without tags"},
    {u"<!-- <Name> -->", Kind::InComment, 5, u"<Name>", "a tag in a comment"},
    {u"<!-- </Name> -->", Kind::InComment, 5, u"</Name>", "a closing tag in a comment"},
    {u"<!-- <Name a=\"1\"> <b> -->", Kind::InComment, -1, u"", "what is not a tag is harmless in a comment"},
    {u"<!-- --><Name>", Kind::InComment, -1, u"", "a tag after a comment"},
    {u"<!-- <!-- --><Name>", Kind::InComment, -1, u"", "comments do not nest"},
    {u"<!-- <Title>", Kind::InComment, 5, u"<Title>", "a comment without an end"},
    {u"<!-- --> <Name >", Kind::NotATag, 9, u"<Name >", "a blank in a tag after a comment"},
    {u"<Label abcdefghijklmnopqrstuvwxyz0123456789abcdef>", Kind::NotATag, 0,
     u"<Label abcdefghijklmnopqrstuvwxyz01234567…>", "a long tag is quoted by its first 40 characters"},
};

TEST(TagLint, FindsWhatLooksLikeATagAndIsNotOne)
{
    for (const Row &row : rows) {
        const auto remarks = findIgnoredTags(ScanText(QString::fromUtf16(row.text)));
        ASSERT_EQ(remarks.size(), row.source < 0 ? 0U : 1U) << row.reason;
        if (row.source >= 0) {
            EXPECT_EQ(remarks.front().kind, row.kind) << row.reason;
            EXPECT_EQ(remarks.front().source, row.source) << row.reason;
            EXPECT_EQ(remarks.front().text, QString::fromUtf16(row.quote)) << row.reason;
        }
    }
}

TEST(TagLint, KnowsEveryElement)
{
    for (const char *name :
         {"ReportTemplate", "Name",           "Title",        "Tables",    "Table",  "Use",   "Sort",
          "VariableName",   "OutputList",     "Field",        "Label",     "Format", "Align", "Dictionaries",
          "Dictionary",     "DictionaryName", "VariableList", "Variable",  "ID",     "Type",  "Blocks",
          "Block",          "Options",        "Separator",    "PageBreaks"})
    {
        const QString spelled = QString::fromLatin1(name);
        EXPECT_EQ(elementName(spelled.toUpper()), spelled);
        EXPECT_EQ(elementName(spelled.toLower()), spelled);
        EXPECT_EQ(findIgnoredTags(ScanText(u'<' + spelled + QStringLiteral(" >"))).size(), 1U) << name;
    }
    EXPECT_EQ(elementName(u"other"), QStringLiteral("other"));
    EXPECT_EQ(elementName(u""), QString());
}

TEST(TagLint, NamesEveryPlaceInTheOrderOfTheFile)
{
    ScanText text;
    text.append(u"<Name >a</", 100);
    text.append(u" Name><!--<Ti", 200);
    text.append(u"tle>-->", 300);
    const auto remarks = findIgnoredTags(text);
    ASSERT_EQ(remarks.size(), 3U);
    EXPECT_EQ(remarks[0].source, 100);
    EXPECT_EQ(remarks[1].source, 108) << "the tag begins in one line and ends in the next";
    EXPECT_EQ(remarks[1].text, QStringLiteral("</ Name>"));
    EXPECT_EQ(remarks[2].source, 210);
    EXPECT_EQ(remarks[2].kind, Kind::InComment);
}

} // namespace
