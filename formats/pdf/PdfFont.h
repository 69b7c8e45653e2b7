#pragma once

#include "FaceGlyphs.h"
#include "PdfDocument.h"
#include "PdfFaces.h"

#include <QRectF>

#include <hpdf.h>

#include <optional>
#include <vector>

namespace kareport
{

/// A face of a PDF, which is embedded when the first of its characters is shown. Its character codes are those of Unicode.
class PdfFont
{
public:
    explicit PdfFont(const PdfFace &face) : face_(face) {}

    const PdfFace &face() const { return face_; }
    bool covers(char32_t character) const { return face_.covers(character); }

    /// Embeds the face. @return false when the file is missing or is not a font
    bool embed(PdfDocument &pdf);
    bool isEmbedded() const { return font_ != nullptr; }
    HPDF_Font handle() const { return font_; } ///< null until it is embedded

    // All of this is about a face that is embedded.

    /// The advance of a character in thousandths of the font size.
    int advanceOf(char16_t character) const;
    /// The ink of a character from its origin, in thousandths of the font size, y upwards: `top` is its lower edge.
    QRectF inkOf(char16_t character) const;
    /// Puts a character among those that are shown: only their glyphs are embedded.
    void show(char16_t character);
    /// Describes the characters that are shown, and only those: their widths, their glyphs, and what a reader copies of
    /// them. To be called after the last page. @return false after an error
    bool describeCharacters();
    /// Compresses the face, or takes what an earlier PDF's became. To be called after `describeCharacters`, for the faces of
    /// a document in the order in which they were embedded: it gives the face its place in the file. @return false after
    /// an error
    bool compressFace();

private:
    unsigned glyphOf(char16_t character) const;
    bool writeWidths(const std::vector<char16_t> &shown);
    bool writeWidths(const std::vector<char16_t> &characters, int usual);
    bool writeGlyphs(const std::vector<char16_t> &shown);
    bool writeTextMap(const std::vector<char16_t> &shown);

    PdfFace face_;
    HPDF_Font font_ = nullptr;
    std::optional<FaceGlyphs> glyphs_;
    std::vector<bool> isShown_; ///< by character
};

} // namespace kareport
