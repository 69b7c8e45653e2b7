#include "PdfTypesetter.h"

#include <hpdf_font.h>
#include <hpdf_fontdef.h>
#include <hpdf_pages.h>
#include <hpdf_streams.h>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr std::size_t planeSize = 0x10000;
constexpr unsigned char unknownFace = 0xFF;
/// Strings of a PDF end before 65535 bytes; a character takes four at most.
constexpr qsizetype longestRun = 16000;

/// Writes a character code of two bytes into a string.
char *writeCode(char *out, char16_t code)
{
    for (const int byte : {code >> 8, code & 0xFF}) {
        switch (byte) {
        case '(':
        case ')':
        case '\\':
            *out++ = '\\';
            *out++ = static_cast<char>(byte);
            break;
        case '\r': // a bare one would be read as LF
            *out++ = '\\';
            *out++ = 'r';
            break;
        default: *out++ = static_cast<char>(byte);
        }
    }
    return out;
}

} // namespace

bool PdfTypesetter::loadFaces(PdfDocument &pdf, const std::vector<PdfFace> &faces)
{
    for (const PdfFace &face : faces) {
        const HPDF_Font font = pdf.loadFace(face);
        if (font == nullptr) {
            failedFace_ = face.file();
            return false;
        }
        faces_.push_back({face, font, GlyphParts(face)});
    }
    faceOf_.assign(planeSize, unknownFace);
    widths_.assign(planeSize, -1);
    return !faces_.empty();
}

FaceHeight PdfTypesetter::height() const
{
    const HPDF_Box box = HPDF_Font_GetBBox(faces_.front().font);
    return {box.top, box.bottom};
}

bool PdfTypesetter::covers(char32_t character) const
{
    return std::any_of(faces_.begin(), faces_.end(),
                       [character](const Entry &entry) { return entry.face.covers(character); });
}

std::size_t PdfTypesetter::faceOf(char16_t character)
{
    unsigned char &face = faceOf_[character];
    if (face == unknownFace) {
        const auto found = std::find_if(faces_.begin(), faces_.end(),
                                        [character](const Entry &entry) { return entry.face.covers(character); });
        // What nobody has is left to the first face, which has a sign for it.
        face = static_cast<unsigned char>(found != faces_.end() ? found - faces_.begin() : 0);
    }
    return face;
}

int PdfTypesetter::width(char32_t character)
{
    short &width = widths_[character & 0xFFFF];
    if (width < 0) {
        const auto code = static_cast<char16_t>(character);
        const Entry &entry = faces_[faceOf(code)];
        width = static_cast<short>(std::max(0, HPDF_Font_GetUnicodeWidth(entry.font, code)));
        embedParts(entry, code);
    }
    return width;
}

void PdfTypesetter::embedParts(const Entry &entry, char16_t character)
{
    // The library embeds the parts of a glyph, but not the parts of the parts, and none beyond the 32767th glyph: the
    // Greek epsilon or a Hangul syllable would stay blank.
    const auto *font = static_cast<HPDF_FontAttr>(entry.font->attr);
    const auto *face = static_cast<HPDF_TTFontDefAttr>(font->fontdef->attr);
    for (const unsigned part : entry.parts.of(HPDF_TTFontDef_GetGlyphid(font->fontdef, character))) {
        if (part < face->num_glyphs) {
            face->glyph_tbl.flgs[part] = 1;
        }
    }
}

bool PdfTypesetter::addPage(PdfDocument &pdf, const PdfPageBox &box, const LinePlacement &placement,
                            const std::vector<QStringView> &lines)
{
    const HPDF_Page page = pdf.addPage();
    if (page == nullptr) {
        return false;
    }
    HPDF_Page_SetWidth(page, box.width);
    HPDF_Page_SetHeight(page, box.height);
    HPDF_Page_SetFontAndSize(page, faces_.front().font, placement.fontSize);
    HPDF_Page_BeginText(page);
    HPDF_Page_SetTextLeading(page, placement.leading);
    // Every line begins by moving down to it, the first one as well.
    HPDF_Page_MoveTextPos(page, box.left, placement.firstBaseline + placement.leading);
    for (const QStringView line : lines) {
        if (line.isEmpty()) {
            operators_ += "T*\n";
        } else {
            showLine(page, placement.fontSize, line);
        }
    }
    writeOut(page);
    HPDF_Page_EndText(page);
    return pdf.isGood() && !failed_;
}

void PdfTypesetter::showLine(HPDF_Page page, float fontSize, QStringView line)
{
    qsizetype begin = 0;
    while (begin < line.size()) {
        const std::size_t face = faces_.size() > 1 ? faceOf(line[begin].unicode()) : 0;
        qsizetype end = std::min(line.size(), begin + longestRun);
        if (faces_.size() > 1) {
            const auto isOther = [&](QChar character) { return faceOf(character.unicode()) != face; };
            end = std::find_if(line.begin() + begin, line.begin() + end, isOther) - line.begin();
        }
        if (face != 0) {
            writeOut(page);
            HPDF_Page_SetFontAndSize(page, faces_[face].font, fontSize);
        }
        addRun(line.sliced(begin, end - begin), begin == 0);
        if (face != 0) {
            writeOut(page);
            HPDF_Page_SetFontAndSize(page, faces_.front().font, fontSize);
        }
        begin = end;
    }
}

void PdfTypesetter::addRun(QStringView run, bool onNextLine)
{
    const qsizetype size = operators_.size();
    operators_.resize(size + 4 * run.size() + 8);
    char *const begin = operators_.data();
    char *out = begin + size;
    *out++ = '(';
    for (const QChar character : run) {
        out = writeCode(out, character.unicode());
    }
    operators_.truncate(out - begin);
    operators_ += onNextLine ? ")'\n" : ")Tj\n";
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
