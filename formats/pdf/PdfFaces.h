#pragma once

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// A font file of the system that a PDF can embed.
class PdfFace
{
public:
    struct Coverage;

    /// Reads what a file covers. A file that is not a font covers nothing and is refused when it is embedded.
    PdfFace(const QString &file, unsigned index, bool isCollection);
    PdfFace(QString file, unsigned index, bool isCollection, std::shared_ptr<const Coverage> coverage);

    const QString &file() const { return file_; }
    unsigned index() const { return index_; } ///< of the face in a collection, from 0
    bool isCollection() const { return isCollection_; }
    /// Whether the file is a font, as far as its face was found in it.
    bool isFont() const;
    /// Whether the face has a glyph that a PDF can show: nothing beyond U+FFFF is.
    bool covers(char32_t character) const;

private:
    QString file_;
    unsigned index_;
    bool isCollection_;
    std::shared_ptr<const Coverage> coverage_;
};

/// The folders that the system's fonts are in.
QStringList systemFontFolders();

/// The face that comes first, whatever a report holds, where the system has it: MSGOTHIC.TTC or else lucon.TTF.
std::optional<PdfFace> preferredPdfFace(const QStringList &fontFolders);
/// The fixed-pitch faces of the system in the order in which they are tried, collections with CJK last.
std::vector<PdfFace> fixedPitchPdfFaces();

/// The faces of a PDF: the one that its grid is made of comes first, each of the others shows what those before it lack.
/// None where the system has no face at all.
/// @param preferred  comes first whatever it covers
/// @param others     in the order of preference; otherwise the first of them that has all of plain text comes first
std::vector<PdfFace> orderPdfFaces(const std::optional<PdfFace> &preferred, const std::vector<PdfFace> &others);

} // namespace kareport
