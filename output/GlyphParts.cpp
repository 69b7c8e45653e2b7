#include "GlyphParts.h"

#include <QFile>

#include <ft2build.h>
#include FT_FREETYPE_H

#include <algorithm>

namespace kareport
{

struct GlyphParts::Face
{
    FT_Library library = nullptr;
    FT_Face face = nullptr;

    Face() = default;
    Face(const Face &) = delete;
    Face &operator=(const Face &) = delete;
    ~Face()
    {
        if (face != nullptr) {
            FT_Done_Face(face);
        }
        if (library != nullptr) {
            FT_Done_FreeType(library);
        }
    }
};

GlyphParts::GlyphParts(const PdfFace &face) : face_(std::make_unique<Face>())
{
    const QByteArray file = QFile::encodeName(face.file());
    if (FT_Init_FreeType(&face_->library) == 0) {
        FT_New_Face(face_->library, file.constData(), static_cast<FT_Long>(face.index()), &face_->face);
    }
}

GlyphParts::~GlyphParts() = default;
GlyphParts::GlyphParts(GlyphParts &&) noexcept = default;
GlyphParts &GlyphParts::operator=(GlyphParts &&) noexcept = default;

std::vector<unsigned> GlyphParts::of(unsigned glyph) const
{
    std::vector<unsigned> parts{glyph};
    for (std::size_t next = 0; face_->face != nullptr && next < parts.size(); ++next) {
        if (FT_Load_Glyph(face_->face, parts[next], FT_LOAD_NO_SCALE | FT_LOAD_NO_RECURSE) != 0) {
            continue;
        }
        const FT_GlyphSlot slot = face_->face->glyph;
        for (FT_UInt i = 0; slot->format == FT_GLYPH_FORMAT_COMPOSITE && i < slot->num_subglyphs; ++i) {
            FT_Int part = 0;
            FT_UInt flags = 0;
            FT_Int first = 0;
            FT_Int second = 0;
            FT_Matrix transform;
            if (FT_Get_SubGlyph_Info(slot, i, &part, &flags, &first, &second, &transform) == 0 &&
                std::find(parts.begin(), parts.end(), static_cast<unsigned>(part)) == parts.end())
            {
                parts.push_back(static_cast<unsigned>(part));
            }
        }
    }
    parts.erase(parts.begin());
    return parts;
}

} // namespace kareport
