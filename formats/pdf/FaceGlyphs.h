#pragma once

#include "PdfFaces.h"

#include <QRectF>

#include <memory>
#include <vector>

namespace kareport
{

/// What a face's file says about its glyphs.
class FaceGlyphs
{
public:
    /// A face that cannot be read has glyphs without parts and ink.
    explicit FaceGlyphs(const PdfFace &face);
    ~FaceGlyphs();
    FaceGlyphs(FaceGlyphs &&) noexcept;
    FaceGlyphs &operator=(FaceGlyphs &&) noexcept;

    /// The glyphs that a glyph is composed of, and theirs, without the glyph itself: an accented letter is a letter and
    /// an accent, and these may have parts of their own.
    std::vector<unsigned> partsOf(unsigned glyph) const;
    /// The ink of a glyph from its origin, in thousandths of the font size, y upwards: `top` is its lower edge. Empty for a
    /// blank.
    QRectF inkOf(unsigned glyph) const;

private:
    struct Face;

    std::unique_ptr<Face> face_;
};

} // namespace kareport
