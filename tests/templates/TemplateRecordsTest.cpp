#include "TemplateRecords.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

using kareport::FieldElement;
using kareport::parseFieldFormat;
using kareport::ParseSeparatorOption;
using kareport::ScanElement;
using kareport::ScanText;

namespace
{

struct FormatRow
{
    const char16_t *format;
    qint32 width;
    qint32 decimals;
    const char *reason;
};

constexpr FormatRow formatRows[] = {
    {u"", 0, 0, "none"},
    {u"8", 8, 0, "a width alone"},
    {u"12.3", 12, 3, "width and decimals"},
    {u"12.", 12, 0, "a point without decimals"},
    {u".3", 0, 3, "decimals without a width"},
    {u".", 0, 0, "a point alone"},
    {u"12.3.4", 12, 3, "the first point divides"},
    {u"1..4", 1, 0, "nothing between two points"},
    {u" 12. 3", 12, 3, "white space before the numbers"},
    {u"12 .3", 12, 3, "white space after a number"},
    {u"12,3", 12, 0, "a comma is not a point"},
    {u"wide", 0, 0, "no number"},
    {u"x.y", 0, 0, "no numbers"},
    {u"12w.3d", 12, 3, "letters after the numbers"},
    {u"-8.2", -8, 2, "a negative width"},
    {u"8.-2", 8, 0, "negative decimals count as none"},
    {u"8.+2", 8, 2, "a sign"},
    {u"0.0", 0, 0, "zeros"},
    {u"99999999999.99999999999", 2147483647, 2147483647, "numbers outside 32 bits"},
};

TEST(TemplateRecords, ReadsWidthAndDecimals)
{
    for (const FormatRow &row : formatRows) {
        const auto format = parseFieldFormat(row.format);
        EXPECT_EQ(format.width, row.width) << row.reason;
        EXPECT_EQ(format.decimals, row.decimals) << row.reason;
    }
}

struct SeparatorRow
{
    const char16_t *option;
    int code;
    const char *reason;
};

constexpr SeparatorRow separatorRows[] = {
    {u"9", 9, "the code of a tab"},
    {u"44", 44, "the code of a comma"},
    {u"0", 0, "the code 0"},
    {u"255", 255, "the last code"},
    {u"256", 32, "beyond the codes: a blank"},
    {u"300", 32, "beyond the codes: a blank"},
    {u"-1", 32, "below the codes: a blank"},
    {u"-300", 32, "below the codes: a blank"},
    {u"99999999999999999999", 32, "beyond every number: a blank"},
    {u"|", '|', "a character"},
    {u",", ',', "a character"},
    {u" ", ' ', "a blank"},
    {u"TAB", 'T', "the first character of a word"},
    {u"", 0, "no option"},
    {u"09", '0', "not the text of a code: its first character"},
    {u"9 ", '9', "not the text of a code: its first character"},
    {u" 9", ' ', "not the text of a code: its first character"},
    {u"+9", '+', "not the text of a code: its first character"},
    {u"-0", '-', "not the text of a code: its first character"},
    {u"9x", '9', "not the text of a code: its first character"},
    {u"-", '-', "a sign alone is a character"},
    {u"\u0663", 0x63, "an Arabic-Indic digit is not a number: its low 8 bits"},
    {u"000", '0', "not the text of a code: its first character"},
    {u"255 ", '2', "not the text of a code: its first character"},
    {u"256x", 32, "the number decides before the character does"},
    {u"-1x", 32, "the number decides before the character does"},
    {u"300|", 32, "the number decides before the character does"},
    {u"§", 0xA7, "a character of Latin-1"},
    {u"\u20AC", 0xAC, "the low 8 bits of a character beyond"},
    {u"\U0001F600", 0x3D, "the low 8 bits of the first half of a surrogate pair"},
};

TEST(TemplateRecords, ReadsTheSeparator)
{
    for (const SeparatorRow &row : separatorRows) {
        EXPECT_EQ(static_cast<unsigned char>(ParseSeparatorOption(row.option)), row.code) << row.reason;
    }
}

struct FieldRow
{
    const char16_t *name;
    const char16_t *label;
    const char16_t *format;
    const char16_t *align;
    qint32 tableWidth;
    qint32 blockWidth;
    qint32 decimals;
    const char16_t *tableAlign;
    const char16_t *blockAlign;
    const char *reason;
};

constexpr FieldRow fieldRows[] = {
    {u"", u"", u"", u"", 0, 0, 0, u"L", u"L", "an empty field"},
    {u"North", u"fourteen chars", u"10.3", u"", 14, 10, 3, u"L", u"L", "a label wider than its format"},
    {u"North", u"ten chars.", u"10.3", u"", 10, 10, 3, u"L", u"L", "a label as wide as its format"},
    {u"North", u"N", u"10.3", u"RIGHT", 10, 10, 3, u"R", u"R", "a label narrower than its format"},
    {u"North", u"N", u"", u"right", 1, 0, 0, u"R", u"R", "no format: the label alone; any case"},
    {u"North", u"N", u"wide", u"LEFT", 1, 0, 0, u"L", u"L", "a format that is not a number"},
    {u"FLAG", u"", u"", u"CENTER", 1, 0, 0, u"C", u"L", "a flag without a format; centring is for tables"},
    {u"flag", u"Done", u"", u"center", 4, 0, 0, u"C", u"L", "a flag with a label; any case"},
    {u"FLAG", u"", u"0", u"Center", 0, 0, 0, u"C", u"L", "a flag with a format has its width"},
    {u"FLAG", u"", u".", u"", 0, 0, 0, u"L", u"L", "a point is a format"},
    {u"FLAGS", u"", u"", u"", 0, 0, 0, u"L", u"L", "another variable"},
    {u"North", u"", u"-8", u"R", 0, -8, 0, u"L", u"L", "a negative width; a letter is not an alignment"},
    {u"North", u"", u"8", u" RIGHT", 8, 8, 0, u"L", u"L", "values are not trimmed"},
    {u"North", u"", u"8", u"CENTRE", 8, 8, 0, u"L", u"L", "another spelling is not read"},
    {u"North", u"\U0001F600点", u"2", u"", 3, 2, 0, u"L", u"L", "a surrogate pair is two characters wide"},
};

FieldElement elementOf(const FieldRow &row)
{
    const auto part = [](const char16_t *value) { return ScanElement{ScanText(QString::fromUtf16(value)), 0}; };
    FieldElement element;
    element.variableName = part(row.name);
    element.label = part(row.label);
    element.format = part(row.format);
    element.align = part(row.align);
    return element;
}

TEST(TemplateRecords, MakesTheFieldsOfTablesAndBlocks)
{
    for (const FieldRow &row : fieldRows) {
        const sXmlReportField table = kareport::tableField(elementOf(row));
        const sXmlReportField block = kareport::blockField(elementOf(row));
        EXPECT_EQ(table.Width, row.tableWidth) << row.reason;
        EXPECT_EQ(block.Width, row.blockWidth) << row.reason;
        EXPECT_EQ(table.Align, QString::fromUtf16(row.tableAlign)) << row.reason;
        EXPECT_EQ(block.Align, QString::fromUtf16(row.blockAlign)) << row.reason;
        for (const sXmlReportField &field : {table, block}) {
            EXPECT_EQ(field.VariableName, QString::fromUtf16(row.name)) << row.reason;
            EXPECT_EQ(field.Label, QString::fromUtf16(row.label)) << row.reason;
            EXPECT_EQ(field.Decimals, row.decimals) << row.reason;
            EXPECT_EQ(field.ID, -1) << row.reason;
            EXPECT_EQ(field.Type, -1) << row.reason;
        }
    }
}

} // namespace
