#include "PdfClusters.h"

#include "CharacterCells.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// A glyph that is narrower than its room by no more than this is centred in it: readers interpret a gap of a tenth as
/// a blank.
constexpr double slack = 50;
/// The most that a glyph is widened: a wide one of 1000 fills two cells of 602.
constexpr double mostStretch = 1.25;
/// Between a letter's ink and that of a mark.
constexpr double gap = 40;

bool isAboveLetter(char32_t mark)
{
    switch (QChar::combiningClass(mark)) {
    case QChar::Combining_AboveLeft:
    case QChar::Combining_Above:
    case QChar::Combining_AboveRight:
    case QChar::Combining_DoubleAbove: return true;
    default: return false;
    }
}

bool isBelowLetter(char32_t mark)
{
    switch (QChar::combiningClass(mark)) {
    case QChar::Combining_BelowLeft:
    case QChar::Combining_Below:
    case QChar::Combining_BelowRight:
    case QChar::Combining_DoubleBelow: return true;
    default: return false;
    }
}

std::u32string visiblePart(QStringView text)
{
    std::u32string characters;
    for (const char32_t character : text.toUcs4()) {
        if (!isIgnorable(character)) {
            characters += character;
        }
    }
    return characters;
}

} // namespace

void PdfClusters::begin(PdfDocument &pdf, std::vector<PdfFont> &fonts, int cell, char16_t substitute)
{
    pdf_ = &pdf;
    fonts_ = &fonts;
    cell_ = cell;
    substitute_ = substitute;
    single_.assign(planeSize, -1);
}

const PdfCluster &PdfClusters::embed(QStringView text)
{
    int *place = nullptr;
    if (text.size() == 1) {
        place = &single_[text.front().unicode()];
    } else if (const auto known = composite_.find(QString::fromRawData(text.data(), text.size()));
               known != composite_.end())
    {
        place = &known->second;
    } else {
        place = &composite_.emplace(text.toString(), -1).first->second;
    }
    if (*place < 0) {
        *place = static_cast<int>(clusters_.size());
        clusters_.push_back(put(text));
    }
    return clusters_[static_cast<std::size_t>(*place)];
}

std::size_t PdfClusters::fontOf(char32_t character) const
{
    const auto found = std::find_if(fonts_->begin(), fonts_->end(),
                                    [character](const PdfFont &font) { return font.covers(character); });
    return static_cast<std::size_t>(found - fonts_->begin());
}

PdfClusters::Spelling PdfClusters::spellingOf(const std::u32string &characters) const
{
    const std::size_t font = fontOf(characters.front());
    Spelling apart{characters, font};
    if (characters.size() == 1) {
        return apart;
    }
    const QString text = QString::fromUcs4(characters.data(), static_cast<qsizetype>(characters.size()))
                             .normalized(QString::NormalizationForm_C);
    const std::u32string composed = visiblePart(text);
    if (composed.size() == characters.size()) {
        return apart;
    }
    if (font < fonts_->size() && (*fonts_)[font].covers(composed.front())) {
        return {composed, font};
    }
    // A character that the letter's own face does not have is taken from another face only if it cannot be composed.
    const bool canBePutTogether =
        std::all_of(characters.begin(), characters.end(), [this](char32_t c) { return fontOf(c) < fonts_->size(); });
    const std::size_t other = fontOf(composed.front());
    const bool isHangul = cellsOf(composed.front()) == 2;
    return other == fonts_->size() || (canBePutTogether && !isHangul) ? apart : Spelling{composed, other};
}

PdfCluster PdfClusters::put(QStringView text)
{
    PdfCluster cluster;
    const std::u32string characters = visiblePart(text);
    if (characters.empty()) {
        return cluster;
    }
    cluster.cells = cellsOf(characters.front());
    auto [drawn, font] = spellingOf(characters);
    char32_t base = drawn.front();
    cluster.text = QString::fromUcs4(characters.data(), static_cast<qsizetype>(characters.size()));
    if (font == fonts_->size()) {
        cluster.missing.push_back(base);
        base = substitute_;
        font = std::min(fontOf(base), fonts_->size() - 1);
        cluster.text.replace(0, QChar::requiresSurrogates(drawn.front()) ? 2 : 1, QChar(substitute_));
    }
    // A mark without a letter is drawn in the cell that follows, and takes none.
    const double width = std::max(1, cluster.cells) * double(cell_);
    if (!show(font, static_cast<char16_t>(base))) {
        return cluster;
    }
    cluster.glyphs.push_back(fitted(font, static_cast<char16_t>(base), width));
    if (drawn.size() > 1) {
        const PdfGlyph &letter = cluster.glyphs.front();
        const QRectF ink = (*fonts_)[font].inkOf(letter.code);
        QRectF used(letter.left + ink.left() * letter.stretch, ink.top(), ink.width() * letter.stretch, ink.height());
        if (ink.isEmpty()) {
            used = QRectF(0, 0, width, 0);
        }
        for (const char32_t mark : drawn.substr(1)) {
            putMark(cluster, mark, used);
        }
    }
    cluster.isSpelledOut =
        characters.size() == 1 && (base == U' ' || cluster.glyphs.front().advance > width - 2 * slack);
    return cluster;
}

bool PdfClusters::show(std::size_t font, char16_t code)
{
    PdfFont &used = (*fonts_)[font];
    if (!used.isEmbedded() && !used.embed(*pdf_)) {
        failedFace_ = failedFace_.value_or(used.face());
        return false;
    }
    used.show(code);
    return true;
}

PdfGlyph PdfClusters::fitted(std::size_t font, char16_t code, double width)
{
    const double advance = (*fonts_)[font].advanceOf(code);
    PdfGlyph glyph{font, code, 0, 0, 1, advance};
    if (advance <= 0) {
        const QRectF ink = (*fonts_)[font].inkOf(code);
        glyph.left = width / 2 - ink.center().x();
        return glyph;
    }
    if (advance > width || advance < width - slack) {
        glyph.stretch = std::min(mostStretch, width / advance);
        glyph.advance = advance * glyph.stretch;
    }
    glyph.left = (width - glyph.advance) / 2;
    return glyph;
}

void PdfClusters::putMark(PdfCluster &cluster, char32_t mark, QRectF &ink)
{
    const std::size_t letterFont = cluster.glyphs.front().font;
    const std::size_t font = (*fonts_)[letterFont].covers(mark) ? letterFont : fontOf(mark);
    if (font == fonts_->size()) {
        cluster.missing.push_back(mark);
        return;
    }
    const auto code = static_cast<char16_t>(mark);
    if (!show(font, code)) {
        return;
    }
    PdfGlyph glyph{font, code, 0, 0, 1, static_cast<double>((*fonts_)[font].advanceOf(code))};
    const QRectF own = (*fonts_)[font].inkOf(code);
    glyph.left = ink.center().x() - own.center().x();
    if (isAboveLetter(mark)) {
        glyph.rise = std::max(0.0, ink.bottom() + gap - own.top());
        ink.setBottom(std::max(ink.bottom(), own.bottom() + glyph.rise));
    } else if (isBelowLetter(mark)) {
        glyph.rise = std::min(0.0, ink.top() - gap - own.bottom());
        ink.setTop(std::min(ink.top(), own.top() + glyph.rise));
    }
    cluster.glyphs.push_back(glyph);
}

} // namespace kareport
