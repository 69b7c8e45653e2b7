#include "TemplateText.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::equalFolded;
using kareport::FieldMarker;
using kareport::fieldMarker;
using kareport::foldedKey;
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
    {u"12abc", 12, "up to what is no digit"},
    {u"12.7", 12, "up to the point, not rounded"},
    {u"1 2", 1, "up to a blank"},
    {u"abc", 0, "no digit at all"},
    {u"a12", 0, "a digit too late"},
    {u"  12", 12, "behind blanks"},
    {u"\t\n\r 12", 12, "behind white space"},
    {u"-12", -12, "a minus"},
    {u"+12", 12, "a plus"},
    {u" -12", -12, "a minus behind a blank"},
    {u"- 12", 0, "a blank behind the minus"},
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

TEST(TemplateText, ReadsTheLeadingInteger)
{
    for (const NumberRow &row : numberRows) {
        EXPECT_EQ(leadingInteger(row.text), row.number) << row.reason;
    }
}

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
    {u"[", u"{", false, "characters 32 apart that are no letters"},
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

TEST(TemplateText, ComparesWithoutRegardToCase)
{
    for (const FoldRow &row : foldRows) {
        EXPECT_EQ(equalFolded(row.left, row.right), row.equal) << row.reason;
        EXPECT_EQ(equalFolded(row.right, row.left), row.equal) << row.reason;
    }
}

TEST(TemplateText, KeysAreTheSameForNamesThatAreTheSame)
{
    for (const FoldRow &row : foldRows) {
        EXPECT_EQ(foldedKey(row.left) == foldedKey(row.right), row.equal) << row.reason;
    }
}

QString textOf(char32_t code)
{
    return QString::fromUcs4(&code, 1);
}

TEST(TemplateText, KeysAndComparisonAgreeOnEveryCharacter)
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

TEST(TemplateText, HalvesOfSurrogatePairsStayDifferent)
{
    // A cut can leave one behind.
    const QString first(QChar(0xD83D));
    const QString second(QChar(0xD83E));
    EXPECT_FALSE(equalFolded(first, second));
    EXPECT_NE(foldedKey(first), foldedKey(second));
}

struct MarkerRow
{
    const char16_t *name;
    FieldMarker marker;
    const char *reason;
};

constexpr MarkerRow markerRows[] = {
    {u"FILLER", FieldMarker::Filler, "capitals"},
    {u"Filler", FieldMarker::Filler, "any case"},
    {u"SUFFIX_R", FieldMarker::SuffixR, "capitals"},
    {u"suffix_r", FieldMarker::SuffixR, "any case"},
    {u"SUFFIX_+", FieldMarker::SuffixPlus, "capitals"},
    {u"Suffix_+", FieldMarker::SuffixPlus, "any case"},
    {u"", FieldMarker::None, "no name"},
    {u"FILLER ", FieldMarker::None, "a blank behind"},
    {u"FILLERS", FieldMarker::None, "a longer name"},
    {u"SUFFIX_", FieldMarker::None, "no style"},
    {u"SUFFIX_L", FieldMarker::None, "another letter"},
    {u"Northing", FieldMarker::None, "a variable"},
};

TEST(TemplateText, KnowsTheMarkers)
{
    for (const MarkerRow &row : markerRows) {
        EXPECT_EQ(fieldMarker(row.name), row.marker) << row.reason;
    }
}

} // namespace
