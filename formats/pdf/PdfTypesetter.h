#pragma once

#include "PdfClusters.h"
#include "PdfDocument.h"
#include "PdfFont.h"
#include "PdfGeometry.h"

#include <QString>
#include <QStringView>

#include <functional>
#include <span>
#include <string>
#include <vector>

namespace kareport
{

/// Sets lines of text on the pages of a PDF, on the grid of cells of its first face.
class PdfTypesetter
{
public:
    explicit PdfTypesetter(PdfDocument &pdf) : pdf_(pdf) {}

    /// Prepares for a text of these characters. Each is shown in the first face that has it; the first face is embedded
    /// now, the others when they are needed. @return false when the first face cannot be used
    bool begin(const std::vector<PdfFace> &faces, const std::u32string &characters);
    /// The file of a face that could not be used; empty when there is none.
    QString failedFace() const;

    /// The height of the face that texts are set in, in thousandths of the font size.
    FaceHeight height() const;
    /// The advance of a cell, in thousandths of the font size.
    int cell() const { return cell_; }
    /// Whether a face has every character of the text.
    bool coversAll() const { return coversAll_; }
    /// Embeds the faces and notes the glyphs that a line needs beyond those of `begin`, and tells the characters that no
    /// face has.
    void prepare(QStringView line, const std::function<void(char32_t)> &isMissing);

    /// Adds a page with these lines, which fit its box. @return false after an error
    bool addPage(const PdfPageBox &box, const LinePlacement &placement, std::span<const QStringView> lines);
    /// Ends the document's fonts. To be called after the last page. @return false after an error
    bool finish();

private:
    bool isPlain(QStringView line) const;
    void addPlain(QStringView line);
    void addCells(HPDF_Page page, double fontSize, QStringView line);
    qsizetype collectWord(QStringView line, qsizetype begin);
    void writeOut(HPDF_Page page);

    PdfDocument &pdf_;
    std::vector<PdfFont> fonts_;
    int cell_ = 0;
    bool coversAll_ = false;
    bool isAllPlain_ = false;
    std::vector<bool> isPlain_; ///< by character: one of the first face that fills one cell, as it is
    PdfClusters clusters_;
    std::vector<const PdfCluster *> word_; ///< a blank, or characters without one
    QByteArray operators_;                 ///< of the current page, not yet written to it
    bool failed_ = false;
};

} // namespace kareport
