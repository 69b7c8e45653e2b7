#include "FaceGlyphs.h"

#include "FaceFiles.h"

#include <algorithm>

namespace kareport
{

struct FaceGlyphs::Face
{
    QByteArray bytes; ///< of a face that is read from memory
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

FaceGlyphs::FaceGlyphs(const PdfFace &face) : face_(std::make_unique<Face>())
{
    if (FT_Init_FreeType(&face_->library) == 0) {
        face_->face = openFaceFile(face_->library, face.file(), face.index(), face_->bytes);
    }
}

FaceGlyphs::~FaceGlyphs() = default;
FaceGlyphs::FaceGlyphs(FaceGlyphs &&) noexcept = default;
FaceGlyphs &FaceGlyphs::operator=(FaceGlyphs &&) noexcept = default;

std::vector<unsigned> FaceGlyphs::partsOf(unsigned glyph) const
{
    std::vector<unsigned> parts{glyph};
    for (std::size_t next = 0; face_->face != nullptr && next < parts.size(); ++next) {
        if (FT_Load_Glyph(face_->face, parts[next], FT_LOAD_NO_SCALE | FT_LOAD_NO_RECURSE) != 0) {
            continue;
        }
        auto *const slot = face_->face->glyph;
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

QRectF FaceGlyphs::inkOf(unsigned glyph) const
{
    if (face_->face == nullptr || face_->face->units_per_EM == 0 ||
        FT_Load_Glyph(face_->face, glyph, FT_LOAD_NO_SCALE) != 0)
    {
        return {};
    }
    const FT_Glyph_Metrics &metrics = face_->face->glyph->metrics;
    const double unit = 1000.0 / face_->face->units_per_EM;
    return {static_cast<double>(metrics.horiBearingX) * unit,
            static_cast<double>(metrics.horiBearingY - metrics.height) * unit,
            static_cast<double>(metrics.width) * unit, static_cast<double>(metrics.height) * unit};
}

} // namespace kareport
