#include "PdfTypesetter.h"

#include "CharacterCells.h"
#include "PdfLineWriter.h"

#include <hpdf_objects.h>
#include <hpdf_pages.h>
#include <hpdf_streams.h>

#include <algorithm>

namespace kareport
{

namespace
{

/// Strings of a PDF end before 65535 bytes; a character takes four at most.
constexpr qsizetype longestRun = 16000;

/// The grid of a face: the advance of its figures and letters. Where they differ, the widest of them has room.
int cellOf(const PdfFont &font)
{
    int cell = 0;
    for (char16_t character = u' '; character <= u'~'; ++character) {
        if (font.covers(character)) {
            cell = std::max(cell, font.advanceOf(character));
        }
    }
    return cell;
}

} // namespace

bool PdfTypesetter::begin(const std::vector<PdfFace> &faces, const std::u32string &characters)
{
    fonts_ = std::vector<PdfFont>(faces.begin(), faces.end());
    PdfFont &base = fonts_.front();
    cell_ = base.embed(pdf_) ? cellOf(base) : 0;
    if (cell_ == 0) {
        return false;
    }
    const auto isCovered = [this](char32_t character) {
        return std::any_of(fonts_.begin(), fonts_.end(),
                           [character](const PdfFont &font) { return font.covers(character); });
    };
    clusters_.begin(pdf_, fonts_, cell_,
                    isCovered(QChar::ReplacementCharacter) ? char16_t(QChar::ReplacementCharacter) : u'?');
    coversAll_ = std::all_of(characters.begin(), characters.end(), isCovered);
    isPlain_.assign(planeSize, false);
    isAllPlain_ = true;
    for (const char32_t character : characters + U' ') { // tabs become blanks
        const auto code = static_cast<char16_t>(character);
        const bool isPlain = base.covers(character) && cellsOf(character) == 1 && base.advanceOf(code) == cell_;
        if (isPlain) {
            base.show(code);
            isPlain_[code] = true;
        }
        isAllPlain_ = isAllPlain_ && isPlain;
    }
    return true;
}

QString PdfTypesetter::failedFace() const
{
    if (!fonts_.empty() && !fonts_.front().isEmbedded()) {
        return fonts_.front().face().file();
    }
    return clusters_.failedFace() ? clusters_.failedFace()->file() : QString();
}

FaceHeight PdfTypesetter::height() const
{
    const HPDF_Box box = HPDF_Font_GetBBox(fonts_.front().handle());
    return {box.top, box.bottom};
}

void PdfTypesetter::prepare(QStringView line, const std::function<void(char32_t)> &isMissing)
{
    if (isPlain(line)) {
        return;
    }
    for (qsizetype at = 0; at < line.size();) {
        const qsizetype end = clusterEnd(line, at);
        for (const char32_t character : clusters_.embed(line.sliced(at, end - at)).missing) {
            isMissing(character);
        }
        at = end;
    }
}

bool PdfTypesetter::addPage(const PdfPageBox &box, const LinePlacement &placement, std::span<const QStringView> lines)
{
    const HPDF_Page page = pdf_.addPage();
    if (page == nullptr) {
        return false;
    }
    HPDF_Page_SetWidth(page, box.width);
    HPDF_Page_SetHeight(page, box.height);
    HPDF_Page_SetFontAndSize(page, fonts_.front().handle(), placement.fontSize);
    HPDF_Page_BeginText(page);
    HPDF_Page_SetTextLeading(page, placement.leading);
    // Every line begins by moving down to it, the first one as well.
    HPDF_Page_MoveTextPos(page, box.left, placement.firstBaseline + placement.leading);
    for (const QStringView line : lines) {
        if (line.isEmpty()) {
            operators_ += "T*\n";
        } else if (isPlain(line)) {
            addPlain(line);
        } else {
            addCells(page, double(placement.fontSize), line);
        }
    }
    writeOut(page);
    HPDF_Page_EndText(page);
    return pdf_.isGood() && !failed_ && failedFace().isEmpty();
}

bool PdfTypesetter::finish()
{
    std::vector<PdfFont *> embedded;
    for (PdfFont &font : fonts_) {
        if (font.isEmbedded()) {
            embedded.push_back(&font);
        }
    }
    // The objects of a document are numbered in their order.
    std::sort(embedded.begin(), embedded.end(), [](const PdfFont *first, const PdfFont *second) {
        return first->handle()->header.obj_id < second->handle()->header.obj_id;
    });
    return std::all_of(embedded.begin(), embedded.end(),
                       [](PdfFont *font) { return font->describeCharacters() && font->compressFace(); });
}

bool PdfTypesetter::isPlain(QStringView line) const
{
    return isAllPlain_ ||
           std::all_of(line.begin(), line.end(), [this](QChar character) { return isPlain_[character.unicode()]; });
}

void PdfTypesetter::addPlain(QStringView line)
{
    for (qsizetype begin = 0; begin < line.size(); begin += longestRun) {
        addPdfString(operators_, line.sliced(begin, std::min(longestRun, line.size() - begin)));
        operators_ += begin == 0 ? "'\n" : "Tj\n";
    }
}

void PdfTypesetter::addCells(HPDF_Page page, double fontSize, QStringView line)
{
    operators_ += "T*\n";
    const auto nameOf = [this, page](std::size_t font) {
        return HPDF_Page_GetLocalFontName(page, fonts_[font].handle());
    };
    PdfLineWriter writer(operators_, nameOf, fontSize);
    double left = 0;
    for (qsizetype at = 0; at < line.size();) {
        at = collectWord(line, at);
        const bool isSpelledOut =
            std::all_of(word_.begin(), word_.end(), [](const PdfCluster *cluster) { return cluster->isSpelledOut; });
        if (!isSpelledOut) {
            QString text;
            for (const PdfCluster *cluster : word_) {
                text += cluster->text;
            }
            writer.beginText(text);
        }
        for (const PdfCluster *cluster : word_) {
            for (const PdfGlyph &glyph : cluster->glyphs) {
                writer.show(glyph.font, glyph.code, left + glyph.left, glyph.rise, glyph.stretch, glyph.advance);
            }
            left += cluster->cells * double(cell_);
        }
        if (!isSpelledOut) {
            writer.endText();
        }
    }
    writer.end();
}

qsizetype PdfTypesetter::collectWord(QStringView line, qsizetype begin)
{
    word_.clear();
    qsizetype at = begin;
    while (at < line.size()) {
        const qsizetype end = clusterEnd(line, at);
        const QStringView cluster = line.sliced(at, end - at);
        if (cluster == u" " && !word_.empty()) {
            break;
        }
        word_.push_back(&clusters_.embed(cluster));
        at = end;
        if (cluster == u" ") {
            break;
        }
    }
    return at;
}

void PdfTypesetter::writeOut(HPDF_Page page)
{
    // The library's own text functions write four hexadecimal digits for each character. The same codes as bytes compress
    // in less than half the time, take half the memory, and let a page be written in one piece.
    auto *attributes = static_cast<HPDF_PageAttr>(page->attr);
    failed_ =
        failed_ || HPDF_Stream_Write(attributes->stream, reinterpret_cast<const HPDF_BYTE *>(operators_.constData()),
                                     static_cast<HPDF_UINT>(operators_.size())) != HPDF_OK;
    operators_.resize(0);
}

} // namespace kareport
