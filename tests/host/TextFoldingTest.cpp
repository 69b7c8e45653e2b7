#include "TextFolding.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::equalFolded;
using kareport::foldedKey;

namespace
{

struct FoldRow
{
    const char16_t *left;
    const char16_t *right;
    bool equal;
    const char *reason;
};

constexpr FoldRow foldRows[] = {
    {u"", u"", true, "nothing and nothing"},
    {u"", u"a", false, "nothing and something"},
    {u"Points", u"pOINTS", true, "ASCII letters"},
    {u"Points", u"Points ", false, "a blank counts"},
    {u"Point", u"Points", false, "the begin of a name is not the name"},
    {u"a_1", u"A_1", true, "what has no case stays"},
    {u"[", u"{", false, "characters 32 apart that are not letters"},
    {u"é", u"É", true, "accented letters"},
    {u"жук", u"ЖУК", true, "Cyrillic"},
    {u"σ", u"ς", true, "the final sigma is a sigma"},
    {u"ß", u"ss", false, "no character becomes two"},
    {u"ß", u"SS", false, "no character becomes two, capitals"},
    {u"ſ", u"S", true, "the long s is an s"},
    {u"\u212A", u"k", true, "the sign for kelvin is a k"},
    {u"ı", u"I", false, "the dotless i is a letter of its own when names are compared"},
    {u"İ", u"i", false, "the capital I with a dot has no simple folding"},
    {u"e\u0301", u"é", false, "composed and decomposed letters differ"},
    {u"\U00010400", u"\U00010428", true, "letters outside the basic plane fold as well"},
    {u"\U0001F600", u"\U0001F601", false, "two surrogate pairs with the same first half"},
    {u"点", u"點", false, "CJK has no case"},
};

TEST(TextFolding, ComparesWithoutRegardToCase)
{
    for (const FoldRow &row : foldRows) {
        EXPECT_EQ(equalFolded(row.left, row.right), row.equal) << row.reason;
        EXPECT_EQ(equalFolded(row.right, row.left), row.equal) << row.reason;
    }
}

TEST(TextFolding, KeysAreTheSameForNamesThatAreTheSame)
{
    for (const FoldRow &row : foldRows) {
        EXPECT_EQ(foldedKey(row.left) == foldedKey(row.right), row.equal) << row.reason;
    }
}

QString textOf(char32_t code)
{
    return QString::fromUcs4(&code, 1);
}

TEST(TextFolding, KeysAndComparisonAgreeOnEveryCharacter)
{
    for (char32_t code = 1; code < 0x11000; ++code) {
        if (QChar::isSurrogate(code)) {
            continue;
        }
        const QString text = textOf(code);
        for (const char32_t other : {QChar::toUpper(code), QChar::toLower(code), QChar::toCaseFolded(code)}) {
            const QString variant = textOf(other);
            ASSERT_EQ(equalFolded(text, variant), foldedKey(text) == foldedKey(variant)) << text.toStdString();
        }
    }
}

TEST(TextFolding, HalvesOfSurrogatePairsStayDifferent)
{
    // A cut can leave one.
    const QString first(QChar(0xD83D));
    const QString second(QChar(0xD83E));
    EXPECT_FALSE(equalFolded(first, second));
    EXPECT_NE(foldedKey(first), foldedKey(second));
}

} // namespace
