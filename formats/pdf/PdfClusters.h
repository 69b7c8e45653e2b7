#pragma once

#include "PdfFont.h"

#include <QString>

#include <deque>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// A glyph of a cluster. Lengths are thousandths of the font size.
struct PdfGlyph
{
    std::size_t font = 0;
    char16_t code = 0;
    double left = 0;    ///< its origin, from the left edge of the cluster's first cell
    double rise = 0;    ///< above the baseline
    double stretch = 1; ///< how much wider than in its face it is drawn
    double advance = 0; ///< as drawn
};

/// A character with the marks on it, as it is drawn.
struct PdfCluster
{
    int cells = 0;
    std::vector<PdfGlyph> glyphs;
    QString text;                  ///< what it says
    bool isSpelledOut = true;      ///< whether its glyphs alone say so, without a gap that is read as a blank
    std::vector<char32_t> missing; ///< characters that no face has
};

/// Puts characters into the cells of a grid: each in the first face that has it, centred in its cell or cells or fitted to
/// them, and marks on their letter.
class PdfClusters
{
public:
    /// @param pdf    where the fonts are embedded as they are needed
    /// @param fonts  the first one, which is embedded, makes the grid; they outlive this object
    /// @param cell   the advance of a cell
    /// @param substitute  takes the place of characters that no face has
    void begin(PdfDocument &pdf, std::vector<PdfFont> &fonts, int cell, char16_t substitute);

    /// The cluster that a piece of text is, which `clusterEnd` has cut, with the faces and glyphs that it needs embedded. The
    /// reference holds as long as this object.
    const PdfCluster &embed(QStringView text);
    /// The face that could not be embedded.
    const std::optional<PdfFace> &failedFace() const { return failedFace_; }

private:
    /// Characters and the font of the first of them; the number of fonts where none has it.
    struct Spelling
    {
        std::u32string characters;
        std::size_t font;
    };

    PdfCluster put(QStringView text);
    Spelling spellingOf(const std::u32string &characters) const;
    bool show(std::size_t font, char16_t code);
    PdfGlyph fitted(std::size_t font, char16_t code, double width);
    void putMark(PdfCluster &cluster, char32_t mark, QRectF &ink);
    std::size_t fontOf(char32_t character) const;

    PdfDocument *pdf_ = nullptr;
    std::vector<PdfFont> *fonts_ = nullptr;
    int cell_ = 0;
    char16_t substitute_ = 0;
    std::optional<PdfFace> failedFace_;
    std::deque<PdfCluster> clusters_;
    std::vector<int> single_; ///< places of the clusters that are one character of U+FFFF at most; below 0: none yet
    std::unordered_map<QString, int> composite_; ///< places of the others
};

} // namespace kareport
