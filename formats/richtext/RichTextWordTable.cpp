#include "RichTextWordTable.h"

#include "RichTextState.h"

#include <QFont>

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>

namespace kareport
{

namespace
{

using enum RichTextAction;

/// In the order of the names, in which they are looked up.
constexpr RichTextWord words[] = {
    {"aftncn", Skip},
    {"aftnsep", Skip},
    {"aftnsepc", Skip},
    {"annotation", SkipCounted, FootnoteNote},
    {"ansi", CodePage, 1252},
    {"ansicpg", AnsiCodePage},
    {"atnauthor", Skip},
    {"atndate", Skip},
    {"atnicn", Skip},
    {"atnid", Skip},
    {"atnref", Skip},
    {"atntime", Skip},
    {"atrfend", Skip},
    {"atrfstart", Skip},
    {"b", Toggle, BoldFlag},
    {"bkmkend", Skip},
    {"bkmkstart", Skip},
    {"blue", Blue},
    {"bullet", Insert, 0x2022},
    {"caps", Toggle, CapitalsFlag},
    {"cb", Background},
    {"cbpat", Shading},
    {"cell", Cell},
    {"cf", Foreground},
    {"chcbpat", Background},
    {"colortbl", ColourTable},
    {"cpg", FontCodePage},
    {"cs", Style},
    {"datafield", Skip},
    {"datastore", Skip},
    {"deff", DefaultFont},
    {"dn", VerticalAlignment, QTextCharFormat::AlignSubScript},
    {"do", SkipCounted, ObjectNote},
    {"ds", Style},
    {"emdash", Insert, 0x2014},
    {"emspace", Insert, 0x2003},
    {"endash", Insert, 0x2013},
    {"enspace", Insert, 0x2002},
    {"f", Font},
    {"falt", Skip},
    {"fcharset", FontCharset},
    {"fdecor", FontKind, QFont::Fantasy},
    {"fi", Measure, FirstLineIndent},
    {"filetbl", Skip},
    {"fldinst", Skip},
    {"fldrslt", Shown},
    {"fmodern", FontKind, QFont::Monospace},
    {"fontemb", Skip},
    {"fonttbl", FontTable},
    {"footer", SkipCounted, HeaderNote},
    {"footerf", SkipCounted, HeaderNote},
    {"footerl", SkipCounted, HeaderNote},
    {"footerr", SkipCounted, HeaderNote},
    {"footnote", SkipCounted, FootnoteNote},
    {"formfield", Skip},
    {"froman", FontKind, QFont::Serif},
    {"fs", FontSize},
    {"fscript", FontKind, QFont::Cursive},
    {"fswiss", FontKind, QFont::SansSerif},
    {"ftncn", Skip},
    {"ftnsep", Skip},
    {"ftnsepc", Skip},
    {"generator", Skip},
    {"green", Green},
    {"header", SkipCounted, HeaderNote},
    {"headerf", SkipCounted, HeaderNote},
    {"headerl", SkipCounted, HeaderNote},
    {"headerr", SkipCounted, HeaderNote},
    {"highlight", Highlight},
    {"i", Toggle, ItalicFlag},
    {"info", Skip},
    {"lbr", Insert, 0x2028},
    {"ldblquote", Insert, 0x201C},
    {"li", Measure, LeftIndent},
    {"lin", Measure, LeftIndent},
    {"line", Insert, 0x2028},
    {"listoverridetable", Skip},
    {"listtable", Skip},
    {"listtext", Shown},
    {"lquote", Insert, 0x2018},
    {"ltrmark", Insert, 0x200E},
    {"ltrpar", Direction, Qt::LeftToRight},
    {"mac", CodePage, 10000},
    {"mmath", SkipCounted, ObjectNote},
    {"nestcell", Cell},
    {"nestrow", NestedRow},
    {"nesttableprops", Shown},
    {"nonesttables", Skip},
    {"nonshppict", Skip},
    {"nosupersub", VerticalAlignment, QTextCharFormat::AlignNormal},
    {"objalias", Skip},
    {"objclass", Skip},
    {"objdata", Skip},
    {"object", Object},
    {"objname", Skip},
    {"objsect", Skip},
    {"objtime", Skip},
    {"page", PageBreak},
    {"pagebb", PageBreakBefore},
    {"panose", Skip},
    {"par", EndParagraph},
    {"pard", ParagraphDefaults},
    {"pc", CodePage, 437},
    {"pca", CodePage, 850},
    {"pict", Picture},
    {"plain", Plain},
    {"pnseclvl", Skip},
    {"pntext", Shown},
    {"pntxta", Skip},
    {"pntxtb", Skip},
    {"private1", Skip},
    {"qc", Align, Qt::AlignHCenter},
    {"qd", Align, Qt::AlignJustify},
    {"qj", Align, Qt::AlignJustify},
    {"ql", Align, Qt::AlignLeft},
    {"qmspace", Insert, 0x2005},
    {"qr", Align, Qt::AlignRight},
    {"rdblquote", Insert, 0x201D},
    {"red", Red},
    {"result", ObjectResult},
    {"revtbl", Skip},
    {"ri", Measure, RightIndent},
    {"rin", Measure, RightIndent},
    {"row", Row},
    {"rquote", Insert, 0x2019},
    {"rsidtbl", Skip},
    {"rtlmark", Insert, 0x200F},
    {"rtlpar", Direction, Qt::RightToLeft},
    {"rxe", Skip},
    {"s", Style},
    {"sa", Measure, SpaceAfter},
    {"sb", Measure, SpaceBefore},
    {"sbkcol", SamePage},
    {"sbknone", SamePage},
    {"scaps", Toggle, SmallCapitalsFlag},
    {"sect", SectionBreak},
    {"shp", SkipCounted, ObjectNote},
    {"shppict", Picture},
    {"sl", Measure, LineSpacing},
    {"slmult", Measure, LineSpacingIsMultiple},
    {"strike", Toggle, StrikeFlag},
    {"striked", Toggle, StrikeFlag},
    {"stylesheet", Skip},
    {"sub", VerticalAlignment, QTextCharFormat::AlignSubScript},
    {"super", VerticalAlignment, QTextCharFormat::AlignSuperScript},
    {"tab", Insert, 0x0009},
    {"tc", Skip},
    {"tcn", Skip},
    {"template", Skip},
    {"themedata", Skip},
    {"tqc", TabKind, QTextOption::CenterTab},
    {"tqdec", TabKind, QTextOption::DelimiterTab},
    {"tqr", TabKind, QTextOption::RightTab},
    {"ts", Style},
    {"tx", TabStop},
    {"u", Unicode},
    {"uc", FallbackCount},
    {"ud", UnicodeForm},
    {"ul", Underline, QTextCharFormat::SingleUnderline},
    {"uld", Underline, QTextCharFormat::DotLine},
    {"uldash", Underline, QTextCharFormat::DashUnderline},
    {"uldashd", Underline, QTextCharFormat::DashDotLine},
    {"uldashdd", Underline, QTextCharFormat::DashDotDotLine},
    {"uldb", Underline, QTextCharFormat::SingleUnderline},
    {"ulhwave", Underline, QTextCharFormat::WaveUnderline},
    {"ulldash", Underline, QTextCharFormat::DashUnderline},
    {"ulnone", Underline, QTextCharFormat::NoUnderline},
    {"ulth", Underline, QTextCharFormat::SingleUnderline},
    {"ulthd", Underline, QTextCharFormat::DotLine},
    {"ulthdash", Underline, QTextCharFormat::DashUnderline},
    {"ulthdashd", Underline, QTextCharFormat::DashDotLine},
    {"ulthdashdd", Underline, QTextCharFormat::DashDotDotLine},
    {"ulthldash", Underline, QTextCharFormat::DashUnderline},
    {"ululdbwave", Underline, QTextCharFormat::WaveUnderline},
    {"ulw", Underline, QTextCharFormat::SingleUnderline},
    {"ulwave", Underline, QTextCharFormat::WaveUnderline},
    {"up", VerticalAlignment, QTextCharFormat::AlignSuperScript},
    {"upr", TwoForms},
    {"userprops", Skip},
    {"v", Toggle, HiddenFlag},
    {"xe", Skip},
    {"xmlnstbl", Skip},
    {"zwbo", Insert, 0x200B},
    {"zwj", Insert, 0x200D},
    {"zwnbo", Insert, 0x2060},
    {"zwnj", Insert, 0x200C},
};

constexpr auto comesBefore = [](const RichTextWord &left, const RichTextWord &right) { return left.name < right.name; };
static_assert(std::is_sorted(std::begin(words), std::end(words), comesBefore));

/// Where the words of each letter begin, and where those of the last one end.
constexpr auto letterStarts = [] {
    std::array<std::size_t, 27> starts{};
    for (std::size_t letter = 0; letter < starts.size(); ++letter) {
        while (starts[letter] < std::size(words) && words[starts[letter]].name[0] - 'a' < static_cast<int>(letter)) {
            ++starts[letter];
        }
    }
    return starts;
}();

} // namespace

const RichTextWord *findRichTextWord(std::string_view name)
{
    if (name.empty() || name[0] < 'a' || name[0] > 'z') {
        return nullptr;
    }
    const auto letter = static_cast<std::size_t>(name[0] - 'a');
    const auto *end = words + letterStarts[letter + 1];
    const auto *word = std::lower_bound(words + letterStarts[letter], end, RichTextWord{name, Skip}, comesBefore);
    return word != end && word->name == name ? word : nullptr;
}

} // namespace kareport
