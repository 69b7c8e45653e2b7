#include "RichTextTables.h"

#include "RichTextUnits.h"
#include "RichTextWriter.h"

#include <QBrush>
#include <QColor>
#include <QFont>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

int rounded(double value)
{
    constexpr double most = 31680;
    return static_cast<int>(std::lround(qBound(-most, value, most)));
}

void appendWord(QByteArray &out, const char *word, int number)
{
    out += word;
    out += QByteArray::number(number);
}

void appendMeasure(QByteArray &out, const char *word, double pixels)
{
    const int twips = rounded(pixels * twipsPerPixel);
    if (twips != 0) {
        appendWord(out, word, twips);
    }
}

const char *familyWord(int hint)
{
    switch (hint) {
    case QFont::Serif: return "\\froman";
    case QFont::SansSerif: return "\\fswiss";
    case QFont::Monospace:
    case QFont::TypeWriter: return "\\fmodern";
    case QFont::Cursive: return "\\fscript";
    case QFont::Fantasy: return "\\fdecor";
    default: return "\\fnil";
    }
}

int hintOf(const QTextCharFormat &format)
{
    return format.hasProperty(QTextFormat::FontStyleHint) ? format.fontStyleHint() : int(QFont::AnyStyle);
}

const char *underlineWord(QTextCharFormat::UnderlineStyle style)
{
    switch (style) {
    case QTextCharFormat::NoUnderline: return "";
    case QTextCharFormat::DashUnderline: return "\\uldash";
    case QTextCharFormat::DotLine: return "\\uld";
    case QTextCharFormat::DashDotLine: return "\\uldashd";
    case QTextCharFormat::DashDotDotLine: return "\\uldashdd";
    case QTextCharFormat::WaveUnderline:
    case QTextCharFormat::SpellCheckUnderline: return "\\ulwave";
    case QTextCharFormat::SingleUnderline: break;
    }
    return "\\ul";
}

const char *alignmentWord(Qt::Alignment alignment)
{
    if (alignment.testFlag(Qt::AlignRight)) {
        return "\\qr";
    }
    if (alignment.testFlag(Qt::AlignHCenter)) {
        return "\\qc";
    }
    return alignment.testFlag(Qt::AlignJustify) ? "\\qj" : "";
}

const char *tabWord(QTextOption::TabType kind)
{
    switch (kind) {
    case QTextOption::RightTab: return "\\tqr";
    case QTextOption::CenterTab: return "\\tqc";
    case QTextOption::DelimiterTab: return "\\tqdec";
    case QTextOption::LeftTab: break;
    }
    return "";
}

void appendLineHeight(QByteArray &out, const QTextBlockFormat &format)
{
    switch (format.lineHeightType()) {
    case QTextBlockFormat::ProportionalHeight:
        appendWord(out, "\\sl", rounded(format.lineHeight() * spacingOfOneLine / 100));
        out += "\\slmult1";
        break;
    case QTextBlockFormat::FixedHeight: appendMeasure(out, "\\sl", -format.lineHeight()); break;
    case QTextBlockFormat::MinimumHeight: appendMeasure(out, "\\sl", format.lineHeight()); break;
    default: break;
    }
}

} // namespace

RichTextTables::RichTextTables(const QTextDocument &document) : document_(document)
{
    // The font of what names none is the first of the table, and so the default one of the file.
    addCharacters(-1, QTextCharFormat());
    int lastCharacters = -1;
    const auto add = [&](int index, const QTextCharFormat &format) {
        if (!characterWords_.contains(index)) {
            addCharacters(index, format);
        }
        lastCharacters = index;
    };
    int lastParagraph = -1;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        if (block.blockFormatIndex() != lastParagraph) {
            lastParagraph = block.blockFormatIndex();
            if (!paragraphWords_.contains(lastParagraph)) {
                addParagraph(lastParagraph, block.blockFormat());
            }
        }
        auto at = block.begin();
        if (at.atEnd() && block.charFormatIndex() != lastCharacters) {
            add(block.charFormatIndex(), block.charFormat());
        }
        for (; !at.atEnd(); ++at) {
            const QTextFragment fragment = at.fragment();
            if (fragment.charFormatIndex() != lastCharacters) {
                add(fragment.charFormatIndex(), fragment.charFormat());
            }
        }
    }
}

QByteArray RichTextTables::header() const
{
    QByteArray out("{\\rtf1\\ansi\\ansicpg1252\\deff0\\uc1\r\n{\\fonttbl");
    for (std::size_t i = 0; i < fonts_.size(); ++i) {
        appendWord(out, "{\\f", static_cast<int>(i));
        out += fonts_[i] + ";}\r\n";
    }
    out += "}\r\n{\\colortbl;";
    for (const unsigned colour : colours_) {
        appendWord(out, "\\red", qRed(colour));
        appendWord(out, "\\green", qGreen(colour));
        appendWord(out, "\\blue", qBlue(colour));
        out += ";\r\n";
    }
    return out + "}\r\n";
}

int RichTextTables::fontNumber(const QTextCharFormat &format)
{
    const QString named = format.fontFamilies().toStringList().value(0);
    const bool isDefault = named.isEmpty();
    QByteArray font = familyWord(isDefault ? int(document_.defaultFont().styleHint()) : hintOf(format));
    font += "\\fcharset0 ";
    appendRichText(font, isDefault ? document_.defaultFont().family() : named);
    font.replace(";", "\\'3b");
    const auto known = fontNumbers_.constFind(font);
    if (known != fontNumbers_.cend()) {
        return known.value();
    }
    const int number = static_cast<int>(fonts_.size());
    fontNumbers_.insert(font, number);
    fonts_.push_back(font);
    return number;
}

int RichTextTables::halfPoints(const QTextCharFormat &format) const
{
    constexpr double pointsPerPixel = 72.0 / 96;
    const QFont font = document_.defaultFont();
    double points = format.fontPointSize();
    if (points <= 0) {
        points = format.intProperty(QTextFormat::FontPixelSize) * pointsPerPixel;
    }
    if (points <= 0) {
        points = font.pointSizeF() > 0 ? font.pointSizeF() : font.pixelSize() * pointsPerPixel;
    }
    return std::max(1, rounded(points * 2));
}

int RichTextTables::colourNumber(const QBrush &brush)
{
    if (brush.style() == Qt::NoBrush) {
        return 0;
    }
    const auto known = colourNumbers_.constFind(brush.color().rgb());
    if (known != colourNumbers_.cend()) {
        return known.value();
    }
    colours_.push_back(brush.color().rgb());
    const int number = static_cast<int>(colours_.size());
    colourNumbers_.insert(colours_.back(), number);
    return number;
}

void RichTextTables::addCharacters(int index, const QTextCharFormat &format)
{
    QByteArray words("\\plain");
    appendWord(words, "\\f", fontNumber(format));
    appendWord(words, "\\fs", halfPoints(format));
    words += format.fontWeight() >= QFont::DemiBold ? "\\b" : "";
    words += format.fontItalic() ? "\\i" : "";
    words += underlineWord(format.underlineStyle());
    words += format.fontStrikeOut() ? "\\strike" : "";
    words += format.fontCapitalization() == QFont::AllUppercase ? "\\caps" : "";
    words += format.fontCapitalization() == QFont::SmallCaps ? "\\scaps" : "";
    words += format.verticalAlignment() == QTextCharFormat::AlignSuperScript ? "\\super" : "";
    words += format.verticalAlignment() == QTextCharFormat::AlignSubScript ? "\\sub" : "";
    if (const int foreground = colourNumber(format.foreground())) {
        appendWord(words, "\\cf", foreground);
    }
    if (const int background = colourNumber(format.background())) {
        // Some readers know one of these words, some the other.
        appendWord(words, "\\cb", background);
        appendWord(words, "\\chcbpat", background);
    }
    characterWords_.emplace(index, words + ' ');
}

void RichTextTables::addParagraph(int index, const QTextBlockFormat &format)
{
    QByteArray words("\\pard");
    words += format.layoutDirection() == Qt::RightToLeft ? "\\rtlpar" : "";
    words += alignmentWord(format.alignment());
    const double left = format.leftMargin() + format.indent() * document_.indentWidth();
    appendMeasure(words, "\\li", left);
    appendMeasure(words, "\\ri", format.rightMargin());
    appendMeasure(words, "\\fi", format.textIndent());
    appendMeasure(words, "\\sb", format.topMargin());
    appendMeasure(words, "\\sa", format.bottomMargin());
    appendLineHeight(words, format);
    for (const QTextOption::Tab &tab : format.tabPositions()) {
        words += tabWord(tab.type);
        appendWord(words, "\\tx", rounded((tab.position + left + format.textIndent()) * twipsPerPixel));
    }
    if (const int shading = colourNumber(format.background())) {
        appendWord(words, "\\cbpat", shading);
    }
    words += format.pageBreakPolicy().testFlag(QTextFormat::PageBreak_AlwaysBefore) ? "\\pagebb" : "";
    paragraphWords_.emplace(index, words);
}

} // namespace kareport
