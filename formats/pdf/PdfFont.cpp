#include "PdfFont.h"

#include "CharacterCells.h"
#include "CompressedFaces.h"

#include <QByteArray>
#include <QScopeGuard>

#include <hpdf_font.h>
#include <hpdf_fontdef.h>
#include <hpdf_objects.h>
#include <hpdf_streams.h>

#include <algorithm>
#include <map>
#include <numeric>
#include <utility>

namespace kareport
{

namespace
{

/// Entries of one block of a text map.
constexpr std::size_t longestBlock = 100;
/// Bytes of each piece that a stream in memory is made of.
constexpr HPDF_UINT pieceSize = 16 * 1024;

HPDF_FontAttr attributesOf(HPDF_Font font)
{
    return static_cast<HPDF_FontAttr>(font->attr);
}

/// Replaces what the library has put in a stream.
bool rewrite(HPDF_Dict stream, QByteArrayView content)
{
    HPDF_MemStream_FreeData(stream->stream);
    return HPDF_Stream_Write(stream->stream, reinterpret_cast<const HPDF_BYTE *>(content.data()),
                             static_cast<HPDF_UINT>(content.size())) == HPDF_OK;
}

/// What has been put into a stream.
QByteArray contentOf(HPDF_Stream stream)
{
    QByteArray content;
    for (HPDF_UINT i = 0; i < HPDF_MemStream_GetBufCount(stream); ++i) {
        HPDF_UINT size = 0;
        const HPDF_BYTE *piece = HPDF_MemStream_GetBufPtr(stream, i, &size);
        content.append(reinterpret_cast<const char *>(piece), size);
    }
    return content;
}

/// Says of a stream that is compressed already what the library says of those that it compresses.
HPDF_STATUS sayCompressed(HPDF_Dict /*stream*/, HPDF_Stream file)
{
    return HPDF_Stream_WriteStr(file, "/Filter [ /FlateDecode ]\n");
}

QByteArray codeText(char16_t code)
{
    return '<' + QByteArray::number(uint(code), 16).rightJustified(4, '0') + '>';
}

/// Characters one after the other, from the first to the last. Codes of a range share their first byte.
using Ranges = std::vector<std::pair<char16_t, char16_t>>;

Ranges rangesOf(const std::vector<char16_t> &shown)
{
    Ranges ranges;
    for (const char16_t character : shown) {
        if (!ranges.empty() && character == ranges.back().second + 1 && (character & 0xFF) != 0) {
            ranges.back().second = character;
        } else {
            ranges.emplace_back(character, character);
        }
    }
    return ranges;
}

} // namespace

bool PdfFont::embed(PdfDocument &pdf)
{
    font_ = pdf.loadFace(face_);
    if (isEmbedded()) {
        glyphs_.emplace(face_);
        isShown_.assign(planeSize, false);
    }
    return isEmbedded();
}

unsigned PdfFont::glyphOf(char16_t character) const
{
    return HPDF_TTFontDef_GetGlyphid(attributesOf(font_)->fontdef, character);
}

int PdfFont::advanceOf(char16_t character) const
{
    return std::max<int>(
        0, HPDF_TTFontDef_GetGidWidth(attributesOf(font_)->fontdef, static_cast<HPDF_UINT16>(glyphOf(character))));
}

QRectF PdfFont::inkOf(char16_t character) const
{
    return glyphs_->inkOf(glyphOf(character));
}

void PdfFont::show(char16_t character)
{
    if (isShown_[character]) {
        return;
    }
    isShown_[character] = true;
    // When asked for the width of a character, the library embeds its glyph and its components, but not the components
    // of the parts, and none beyond the 32767th glyph: the Greek epsilon or a Hangul syllable would stay blank.
    HPDF_Font_GetUnicodeWidth(font_, character);
    const auto *face = static_cast<HPDF_TTFontDefAttr>(attributesOf(font_)->fontdef->attr);
    for (const unsigned part : glyphs_->partsOf(glyphOf(character))) {
        if (part < face->num_glyphs) {
            face->glyph_tbl.flgs[part] = 1;
        }
    }
}

bool PdfFont::describeCharacters()
{
    std::vector<char16_t> shown;
    for (std::size_t character = 0; character < isShown_.size(); ++character) {
        if (isShown_[character]) {
            shown.push_back(static_cast<char16_t>(character));
        }
    }
    return writeWidths(shown) && writeGlyphs(shown) && writeTextMap(shown);
}

bool PdfFont::compressFace()
{
    // The library would make the face when it writes the font, and compress it then.
    if (font_->before_write_fn(font_) != HPDF_OK) {
        return false;
    }
    auto *const face = static_cast<HPDF_Dict>(
        HPDF_Dict_GetItem(attributesOf(font_)->fontdef->descriptor, "FontFile2", HPDF_OCLASS_DICT));
    if (face == nullptr || face->filter != HPDF_STREAM_FILTER_FLATE_DECODE) {
        return face != nullptr;
    }
    const QByteArray content = contentOf(face->stream);
    CompressedFaces &kept = CompressedFaces::ofProcess();
    QByteArray compressed = kept.find(content);
    if (compressed.isEmpty()) {
        // By the library itself: its bytes are those that a document without anything kept has.
        auto *const stream = HPDF_MemStream_New(font_->mmgr, pieceSize);
        if (stream == nullptr) {
            return false;
        }
        const auto freed = qScopeGuard([stream] { HPDF_Stream_Free(stream); });
        if (HPDF_Stream_WriteToStream(face->stream, stream, face->filter, nullptr) != HPDF_OK) {
            return false;
        }
        compressed = contentOf(stream);
        kept.keep(content, compressed);
    }
    face->filter = HPDF_STREAM_FILTER_NONE;
    face->write_fn = &sayCompressed;
    return rewrite(face, compressed);
}

bool PdfFont::writeWidths(const std::vector<char16_t> &shown)
{
    // The library lists the widths of all characters of the face one by one: 200 KB for a CJK face.
    std::map<int, int> counts;
    for (const char16_t character : shown) {
        ++counts[advanceOf(character)];
    }
    const auto usual =
        std::max_element(counts.begin(), counts.end(), [](auto &a, auto &b) { return a.second < b.second; });
    if (usual != counts.end()) {
        return writeWidths(shown, usual->first);
    }
    // Nothing is shown in the face: what the library lists stays, but for its last character.
    std::vector<char16_t> all(planeSize - 1);
    std::iota(all.begin(), all.end(), u'\0');
    return writeWidths(all, attributesOf(font_)->fontdef->missing_width);
}

bool PdfFont::writeWidths(const std::vector<char16_t> &characters, int usual)
{
    auto *const font = attributesOf(font_)->descendant_font;
    auto *const widths = HPDF_Array_New(font_->mmgr);
    bool isDone = widths != nullptr;
    HPDF_Array run = nullptr;
    int next = -1; // the character that would continue the run
    for (const char16_t character : characters) {
        if (!isDone || advanceOf(character) == usual) {
            continue;
        }
        if (character != next) {
            run = HPDF_Array_New(font_->mmgr);
            isDone = run != nullptr && HPDF_Array_AddNumber(widths, character) == HPDF_OK &&
                     HPDF_Array_Add(widths, run) == HPDF_OK;
        }
        isDone = isDone && HPDF_Array_AddNumber(run, advanceOf(character)) == HPDF_OK;
        next = character + 1;
    }
    return isDone && HPDF_Dict_AddNumber(font, "DW", usual) == HPDF_OK && HPDF_Dict_Add(font, "W", widths) == HPDF_OK;
}

bool PdfFont::writeGlyphs(const std::vector<char16_t> &shown)
{
    QByteArray glyphs(shown.empty() ? 2 : 2 * (qsizetype(shown.back()) + 1), '\0');
    for (const char16_t character : shown) {
        const unsigned glyph = glyphOf(character);
        glyphs[2 * character] = static_cast<char>(glyph >> 8);
        glyphs[2 * character + 1] = static_cast<char>(glyph & 0xFF);
    }
    return rewrite(attributesOf(font_)->map_stream, glyphs);
}

bool PdfFont::writeTextMap(const std::vector<char16_t> &shown)
{
    // The library maps codes to glyph numbers here ("cidrange"), which readers do not understand in a text map.
    QByteArray map = "/CIDInit /ProcSet findresource begin\n"
                     "12 dict begin\n"
                     "begincmap\n"
                     "/CIDSystemInfo << /Registry (Adobe) /Ordering (UCS) /Supplement 0 >> def\n"
                     "/CMapName /Adobe-Identity-UCS def\n"
                     "/CMapType 2 def\n"
                     "1 begincodespacerange\n"
                     "<0000> <ffff>\n"
                     "endcodespacerange\n";
    const Ranges ranges = rangesOf(shown);
    for (std::size_t begin = 0; begin < ranges.size(); begin += longestBlock) {
        const std::size_t end = std::min(ranges.size(), begin + longestBlock);
        map += QByteArray::number(quint64(end - begin)) + " beginbfrange\n";
        for (std::size_t i = begin; i < end; ++i) {
            const auto &[first, last] = ranges[i];
            map += codeText(first) + ' ' + codeText(last) + ' ' + codeText(first) + '\n';
        }
        map += "endbfrange\n";
    }
    map += "endcmap\n"
           "CMapName currentdict /CMap defineresource pop\n"
           "end\n"
           "end\n";
    return rewrite(attributesOf(font_)->cmap_stream, map);
}

} // namespace kareport
