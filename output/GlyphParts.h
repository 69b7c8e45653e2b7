#pragma once

#include "PdfFaces.h"

#include <memory>
#include <vector>

namespace kareport
{

/// The glyphs that a face's glyphs are put together from: an accented letter is a letter and an accent, and these may have
/// parts of their own.
class GlyphParts
{
public:
    /// A face that cannot be read has no parts.
    explicit GlyphParts(const PdfFace &face);
    ~GlyphParts();
    GlyphParts(GlyphParts &&) noexcept;
    GlyphParts &operator=(GlyphParts &&) noexcept;

    /// The parts of a glyph, and theirs, without the glyph itself.
    std::vector<unsigned> of(unsigned glyph) const;

private:
    struct Face;

    std::unique_ptr<Face> face_;
};

} // namespace kareport
