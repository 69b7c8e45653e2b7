#include "FormattedField.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

struct FitRow
{
    const char *align;
    int width;
    const char *text;
    const char *expected;
    const char *hash; ///< with "#" for what is too wide
    const char *reason;
};

constexpr FitRow fitRows[] = {
    {"L", 5, "AB", "AB   ", "AB   ", "left"},
    {"R", 5, "AB", "   AB", "   AB", "right"},
    {"C", 7, "AB", "  AB   ", "  AB   ", "centred, 5 missing: two blanks, AB, two blanks and one more"},
    {"C", 3, "AB", " AB ", " AB ", "centred, 1 missing: a blank on either side, one character too wide"},
    {"C", 2, "AB", "AB", "AB", "centred, 0 missing"},
    {"C", 4, "AB", " AB ", " AB ", "centred, 2 missing"},
    {"C", 5, "AB", " AB  ", " AB  ", "centred, 3 missing: one blank, AB, one blank and one more"},
    {"C", 6, "AB", "  AB  ", "  AB  ", "centred, 4 missing"},
    {"C", 1, "AB", "AB", "#", "centred, wider than its column"},
    {"C", 1, "", "  ", "  ", "centred, no text in one column: a blank on either side"},
    {"C", 2, "", "  ", "  ", "centred, no text in two columns"},
    {"C", 3, "", "   ", "   ", "centred, no text in three columns"},
    {"C", 0, "AB", "AB", "", "centred, no width"},
    {"C", 0, "", "", "", "centred, neither text nor width"},
    {"C", -4, "AB", "AB  ", "    ", "centred, a negative width: as wide as the text, filled on the right"},
    {"L", 2, "AB", "AB", "AB", "left, just fits"},
    {"L", 1, "AB", "AB", "#", "left, wider than its column: no character is cut off"},
    {"L", 0, "AB", "AB", "", "left, no width"},
    {"L", -4, "AB", "AB  ", "    ", "left, a negative width fills on the right"},
    {"L", 3, "", "   ", "   ", "left, no text"},
    {"R", 2, "AB", "AB", "AB", "right, just fits"},
    {"R", 1, "AB", "AB", "#", "right, wider than its column"},
    {"R", 0, "AB", "AB", "", "right, no width"},
    {"R", -4, "AB", "AB  ", "    ", "right, a negative width fills on the right"},
    {"R", 3, "", "   ", "   ", "right, no text"},
    {"R", 10, "twelve chars", "twelve chars", "##########", "twelve characters in ten columns are ten \"#\""},
    {"c", 4, "AB", " AB ", " AB ", "a small c"},
    {"", 4, "AB", "  AB", "  AB", "no alignment is right"},
    {"X", 4, "AB", "  AB", "  AB", "another letter is right"},
    {"CENTER", 4, "AB", "  AB", "  AB", "a word is not a letter"},
};

TEST(FieldFormatterFit, FitsATextToItsColumn)
{
    for (const FitRow &row : fitRows) {
        FormattedField formatted(2, row.width, 0, row.align);
        const QString text = QString::fromLatin1(row.text);
        EXPECT_EQ(formatted.of(text), QString::fromLatin1(row.expected)) << row.reason;
        formatted.options.printHash = true;
        EXPECT_EQ(formatted.of(text), QString::fromLatin1(row.hash)) << row.reason << ", with \"#\"";
    }
}

TEST(FieldFormatterFit, CentresEveryTextInItsColumn)
{
    for (int length = 0; length <= 12; ++length) {
        for (int width = 0; width <= 12; ++width) {
            const int missing = width - length;
            // Half of the blanks before, at least one; the odd one after.
            const int before = missing <= 0 ? 0 : missing == 1 ? 1 : missing / 2;
            const int after = missing <= 0 ? 0 : missing == 1 ? 1 : missing - missing / 2;
            const QString text(length, u'x');
            EXPECT_EQ(FormattedField(2, width, 0, "C").of(text), QString(before, u' ') + text + QString(after, u' '))
                << length << " in " << width;
        }
    }
}

TEST(FieldFormatterFit, AlignsNumbersAsWell)
{
    EXPECT_EQ(FormattedField(10, 9, 2, "L").of(2.5), QStringLiteral("    2.50R")) << "they fill their column already";
    EXPECT_EQ(FormattedField(22, 10, 2, "L").of(-1.0), QStringLiteral("ByLayer   ")) << "but this word does not";
    EXPECT_EQ(FormattedField(22, 10, 2, "C").of(-1.0), QStringLiteral(" ByLayer  "));
    EXPECT_EQ(FormattedField(4, 16, 0, "L").of(0.5), QStringLiteral("N 28°38'52\" E   "));
    EXPECT_EQ(FormattedField(19, 3, 0, "C").of(true), QStringLiteral(" Y "));
    EXPECT_EQ(FormattedField(20, 2, 0, "C").of(true), QStringLiteral(" * ")) << "one character too wide";
    EXPECT_EQ(FormattedField(1, 4, 0, "C").of(std::numeric_limits<double>::infinity()), QStringLiteral("    "));
    EXPECT_EQ(FormattedField(-1, 4, 0, "C").of(1.0), QStringLiteral("????"));
}

constexpr struct
{
    const char *text;
    const char *expected;
    const char *reason;
} tabRows[] = {
    {"AB", "AB", "nothing is filled"},
    {"  AB  ", "AB", "blanks at both ends go"},
    {"\r\n A B \t", "A B", "all white space at the ends goes, none in between"},
    {"   ", "", "blanks alone"},
    {"", "", "nothing"},
    {"a longer text", "a longer text", "nothing is cut off"},
};

TEST(FieldFormatterFit, TabSeparatorTrimsAndFillsNothing)
{
    for (const auto &row : tabRows) {
        for (const char *align : {"L", "C", "R"}) {
            for (const int width : {8, 0, -8}) {
                FormattedField formatted(2, width, 0, align);
                formatted.options.separator = u'\t';
                EXPECT_EQ(formatted.of(QString::fromLatin1(row.text)), QString::fromLatin1(row.expected))
                    << row.reason << ", " << align << width;
            }
        }
    }
}

TEST(FieldFormatterFit, TabSeparatorTrimsEveryType)
{
    const struct
    {
        int type;
        double value;
        const char *expected;
    } rows[] = {{1, 2.5, "2.500"},   {5, 2.5, "2.500"},       {9, 2.5, "0+002.500"}, {10, -2.5, "2.50L"},
                {22, -1, "ByLayer"}, {-1, 0, "????????????"}, {3, 0, "0.00"}};
    for (const auto &row : rows) {
        FormattedField formatted(row.type, 12, 2, "C");
        formatted.options.separator = u'\t';
        EXPECT_EQ(formatted.of(row.value), QString::fromLatin1(row.expected)) << row.type;
    }
    FormattedField blank(5, 12);
    blank.options.separator = u'\t';
    blank.options.zeroBlank = true;
    EXPECT_EQ(blank.of(0.0), QString()) << "a zero as blanks";
    FormattedField flag(20, 3);
    flag.options.separator = u'\t';
    EXPECT_EQ(flag.of(false), QString()) << "a flag that is not set";
}

TEST(FieldFormatterFit, TabSeparatorStillMarksWhatIsTooWide)
{
    FormattedField formatted(2, 5, 0, "L");
    formatted.options.separator = u'\t';
    formatted.options.printHash = true;
    EXPECT_EQ(formatted.of(QStringLiteral("ABCDEF")), QStringLiteral("#####"));
    EXPECT_EQ(formatted.of(QStringLiteral("  AB  ")), QStringLiteral("#####")) << "it is measured before it is trimmed";
    EXPECT_EQ(formatted.of(QStringLiteral("ABCDE")), QStringLiteral("ABCDE"));
}

TEST(FieldFormatterFit, OtherSeparatorsFill)
{
    for (const char16_t separator : {u' ', u'|', u'\0', u'\u00FF', u'\uFFE9', u'\n'}) {
        FormattedField formatted(2, 4, 0, "L");
        formatted.options.separator = separator;
        EXPECT_EQ(formatted.of(QStringLiteral(" A")), QStringLiteral(" A  ")) << static_cast<int>(separator);
    }
}

TEST(FieldFormatterFit, MarksEveryTypeThatIsTooWide)
{
    const struct
    {
        int type;
        int width;
        double value;
        const char *expected;
        const char *reason;
    } rows[] = {
        {5, 6, 1234.5, "######", "a coordinate"},
        {5, 8, 1234.5, "1234.500", "a coordinate that just fits"},
        {9, 6, 12345.0, "######", "a station"},
        {10, 4, -2.5, "####", "an offset with its side"},
        {22, 6, -1, "######", "a word"},
        {21, 2, std::numeric_limits<double>::infinity(), "##", "an infinite number"},
        {5, 4, std::numeric_limits<double>::infinity(), "    ", "nothing is not too wide"},
        {5, 0, 1234.5, "", "no column, no marks"},
        {5, -6, 12.0, "      ", "a negative width has no marks, only its blanks"},
        {-1, 3, 0, "???", "question marks fit"},
    };
    for (const auto &row : rows) {
        FormattedField formatted(row.type, row.width, 2);
        formatted.options.printHash = true;
        EXPECT_EQ(formatted.of(row.value), QString::fromLatin1(row.expected)) << row.reason;
    }
    FormattedField blank(5, 0);
    blank.options.printHash = true;
    blank.options.zeroBlank = true;
    EXPECT_EQ(blank.of(0.0), QString()) << "the one blank of a zero is too wide for no column";
}

TEST(FieldFormatterFit, FillerIsBlanksWhateverElseIsSet)
{
    for (const char *name : {"FILLER", "filler", "Filler"}) {
        for (const char *align : {"L", "C", "R"}) {
            for (const char16_t separator : {u' ', u'\t'}) {
                FormattedField formatted(-1, 3, 0, align);
                formatted.field.VariableName = QString::fromLatin1(name);
                formatted.options.separator = separator;
                formatted.options.printHash = true;
                EXPECT_EQ(formatted.of(QStringLiteral("text")), QStringLiteral("   ")) << name << align;
                formatted.field.Width = 0;
                EXPECT_EQ(formatted.of(8, nullptr), QString()) << name << align;
                formatted.field.Width = -3;
                EXPECT_EQ(formatted.of(2.5), QString()) << name << align;
            }
        }
    }
}

TEST(FieldFormatterFit, SuffixMarkersAreFormattedAsTheirTypeSays)
{
    FormattedField formatted(2, 4, 0, "L");
    for (const char *name : {"SUFFIX_R", "SUFFIX_+"}) {
        formatted.field.VariableName = QString::fromLatin1(name);
        EXPECT_EQ(formatted.of(QStringLiteral("A")), QStringLiteral("A   ")) << name;
    }
}

} // namespace
