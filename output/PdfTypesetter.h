#pragma once

#include "GlyphParts.h"
#include "PdfDocument.h"
#include "PdfGeometry.h"

#include <QString>
#include <QStringView>

#include <vector>

namespace kareport
{

/// Sets lines of text on the pages of a PDF.
class PdfTypesetter
{
public:
    /// Embeds the faces. @return false when one of them cannot be used; `failedFace` then says which
    bool loadFaces(PdfDocument &pdf, const std::vector<PdfFace> &faces);
    const QString &failedFace() const { return failedFace_; }

    /// The height of the face that texts are set in, in thousandths of the font size.
    FaceHeight height() const;
    /// The advance of a character in thousandths of the font size. Asking for it also puts the character's glyph among
    /// those that are embedded, so it has to be asked for every character that is shown.
    int width(char32_t character);
    /// Whether a face has the character.
    bool covers(char32_t character) const;

    /// Adds a page with these lines, which fit its box and hold only characters of U+FFFF at most. @return false after an error
    bool addPage(PdfDocument &pdf, const PdfPageBox &box, const LinePlacement &placement,
                 const std::vector<QStringView> &lines);

private:
    struct Entry
    {
        PdfFace face;
        HPDF_Font font = nullptr;
        GlyphParts parts;
    };

    std::size_t faceOf(char16_t character);
    static void embedParts(const Entry &entry, char16_t character);
    void showLine(HPDF_Page page, float fontSize, QStringView line);
    void addRun(QStringView run, bool onNextLine);
    void writeOut(HPDF_Page page);

    std::vector<Entry> faces_;
    QString failedFace_;
    std::vector<unsigned char> faceOf_; ///< by character
    std::vector<short> widths_;         ///< by character; below 0: not asked for yet
    QByteArray operators_;              ///< of the page at hand, not yet written to it
    bool failed_ = false;
};

} // namespace kareport
