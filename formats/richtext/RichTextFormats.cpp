#include "RichTextFormats.h"

#include "RichTextUnits.h"

#include <QBrush>
#include <QColor>

#include <cstdlib>

namespace kareport
{

namespace
{

/// QTextDocument finds a format by a sum over its properties, in which all lists of tab stops count the same, and all font
/// names. A file can hold any number of formats of the same sum, and each would be compared with all before it. A document
/// written by a person never has so many; in one that has, a property without meaning keeps further formats apart.
constexpr std::size_t formatsOfPeople = 500;
constexpr int setsApart = QTextFormat::UserProperty + 0x4B52;

void setApart(QTextFormat &format, std::size_t hash, std::size_t count)
{
    if (count >= formatsOfPeople) {
        format.setProperty(setsApart, static_cast<int>(hash & 0x7FFFFFFF));
    }
}

constexpr std::size_t mixed(std::size_t hash, int value)
{
    hash ^= static_cast<std::size_t>(static_cast<unsigned>(value)) + 0x9E3779B97F4A7C15U + (hash << 6) + (hash >> 2);
    hash *= 0xFF51AFD7ED558CCDU;
    return hash ^ (hash >> 32);
}

double pixels(int twips)
{
    return double(twips) / twipsPerPixel;
}

void setLineHeight(QTextBlockFormat &format, int spacing, bool multiple)
{
    if (spacing == 0) {
        return;
    }
    if (multiple) {
        format.setLineHeight(std::abs(spacing) * 100.0 / spacingOfOneLine, QTextBlockFormat::ProportionalHeight);
    } else if (spacing < 0) {
        format.setLineHeight(pixels(-spacing), QTextBlockFormat::FixedHeight);
    } else {
        format.setLineHeight(pixels(spacing), QTextBlockFormat::MinimumHeight);
    }
}

QTextBlockFormat make(const RichTextParagraph &paragraph)
{
    QTextBlockFormat format;
    if (paragraph.alignment != 0) {
        format.setAlignment(static_cast<Qt::AlignmentFlag>(paragraph.alignment));
    }
    const auto &twips = paragraph.twips;
    const auto measure = [&](std::size_t which, auto set) {
        if (twips[which] != 0) {
            (format.*set)(pixels(twips[which]));
        }
    };
    measure(LeftIndent, &QTextBlockFormat::setLeftMargin);
    measure(RightIndent, &QTextBlockFormat::setRightMargin);
    measure(FirstLineIndent, &QTextBlockFormat::setTextIndent);
    measure(SpaceBefore, &QTextBlockFormat::setTopMargin);
    measure(SpaceAfter, &QTextBlockFormat::setBottomMargin);
    setLineHeight(format, twips[LineSpacing], twips[LineSpacingIsMultiple] == 1);
    if (paragraph.shading != automaticColour) {
        format.setBackground(QColor(static_cast<QRgb>(paragraph.shading)));
    }
    if (paragraph.pageBreakBefore) {
        format.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysBefore);
    }
    if (paragraph.rightToLeft) {
        format.setLayoutDirection(Qt::RightToLeft);
    }
    if (!paragraph.tabs.isEmpty()) {
        // Rich text counts from the margin of the page, the document from where the first line begins.
        QList<QTextOption::Tab> tabs;
        for (const RichTextTab &tab : paragraph.tabs) {
            tabs.append(QTextOption::Tab(pixels(tab.twips - twips[LeftIndent] - twips[FirstLineIndent]), tab.kind));
        }
        format.setTabPositions(tabs);
    }
    return format;
}

} // namespace

std::size_t RichTextFormats::Hash::operator()(const RichTextCharacters &characters) const
{
    std::size_t hash = 0;
    for (const int value : {characters.font, characters.halfPoints, characters.foreground, characters.background,
                            characters.flags, characters.underline, characters.verticalAlignment})
    {
        hash = mixed(hash, value);
    }
    return hash;
}

std::size_t RichTextFormats::Hash::operator()(const RichTextParagraph &paragraph) const
{
    std::size_t hash = 0;
    for (const int value : paragraph.twips) {
        hash = mixed(hash, value);
    }
    for (const int value :
         {paragraph.alignment, paragraph.shading, paragraph.pageBreakBefore ? 1 : 0, paragraph.rightToLeft ? 1 : 0})
    {
        hash = mixed(hash, value);
    }
    for (const RichTextTab &tab : paragraph.tabs) {
        hash = mixed(mixed(hash, tab.twips), tab.kind);
    }
    return hash;
}

int RichTextFormats::character(const RichTextCharacters &characters)
{
    const auto [at, isNew] = characters_.try_emplace(characters, static_cast<int>(characterFormats_.size()));
    if (isNew) {
        characterFormats_.push_back(make(characters));
        setApart(characterFormats_.back(), Hash()(characters), characterFormats_.size());
    }
    return at->second;
}

int RichTextFormats::paragraph(const RichTextParagraph &paragraph)
{
    const auto [at, isNew] = paragraphs_.try_emplace(paragraph, static_cast<int>(paragraphFormats_.size()));
    if (isNew) {
        paragraphFormats_.push_back(kareport::make(paragraph));
        setApart(paragraphFormats_.back(), Hash()(paragraph), paragraphFormats_.size());
    }
    return at->second;
}

QTextCharFormat RichTextFormats::make(const RichTextCharacters &characters) const
{
    QTextCharFormat format;
    if (characters.font >= 0) {
        const RichTextFont &font = (*fonts_)[characters.font];
        format.setFontFamilies({font.family});
        if (font.kind != QFont::AnyStyle) {
            format.setFontStyleHint(font.kind);
        }
    }
    format.setFontPointSize(characters.halfPoints / 2.0);
    if ((characters.flags & BoldFlag) != 0) {
        format.setFontWeight(QFont::Bold);
    }
    if ((characters.flags & ItalicFlag) != 0) {
        format.setFontItalic(true);
    }
    if ((characters.flags & StrikeFlag) != 0) {
        format.setFontStrikeOut(true);
    }
    if ((characters.flags & CapitalsFlag) != 0) {
        format.setFontCapitalization(QFont::AllUppercase);
    } else if ((characters.flags & SmallCapitalsFlag) != 0) {
        format.setFontCapitalization(QFont::SmallCaps);
    }
    if (characters.underline != QTextCharFormat::NoUnderline) {
        format.setUnderlineStyle(static_cast<QTextCharFormat::UnderlineStyle>(characters.underline));
    }
    if (characters.verticalAlignment != QTextCharFormat::AlignNormal) {
        format.setVerticalAlignment(static_cast<QTextCharFormat::VerticalAlignment>(characters.verticalAlignment));
    }
    if (characters.foreground != automaticColour) {
        format.setForeground(QColor(static_cast<QRgb>(characters.foreground)));
    }
    if (characters.background != automaticColour) {
        format.setBackground(QColor(static_cast<QRgb>(characters.background)));
    }
    return format;
}

} // namespace kareport
