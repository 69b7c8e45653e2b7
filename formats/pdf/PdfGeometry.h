#pragma once

#include <QMargins>
#include <QSize>

namespace kareport
{

/// The printed page that a PDF shows.
struct PdfPageSetup
{
    QSize pageSize;          ///< whole sheet, printer dots
    unsigned resolution = 0; ///< dots per inch; 0: the page has not been measured, and nothing can be written
    QMargins margins;        ///< hundredths of a millimetre
    unsigned fontSize = 0;   ///< points
    int linesPerPage = 0;    ///< 1 or more
};

/// A page and the box of its text in PDF points, counted from the sheet's lower left corner.
struct PdfPageBox
{
    float width = 0;
    float height = 0;
    float left = 0;
    float top = 0;
    float right = 0;
    float bottom = 0;
};

/// How far a face reaches above and below its baseline, in thousandths of the font size; below is negative.
struct FaceHeight
{
    float ascent = 0;
    float descent = 0;
};

/// Where the lines of a page are.
struct LinePlacement
{
    float fontSize = 0;      ///< points
    float leading = 0;       ///< points from baseline to baseline
    float firstBaseline = 0; ///< points from the sheet's lower edge
    qsizetype lines = 0;     ///< that a sheet takes; the others continue on the next one
};

PdfPageBox pdfPageBox(const PdfPageSetup &setup);

/// The lines that a page has to have room for: those of a page or, where these would be closer together than the font is high,
/// those of the whole report when they are fewer. A report that is not meant to have pages is given very long ones.
qsizetype linesToFit(const PdfPageSetup &setup, const PdfPageBox &box, const FaceHeight &face, qsizetype linesOfReport);

/// Places the lines of a page in its box: as far apart as the face is high or, where the lines that a page has to have
/// room for do not fit then, as close as they have to be. Lines never run into each other: the font is made smaller where they
/// would, and a page with more lines than expected is made smaller as a whole. Neither gets below `smallestType`; what has no
/// room then continues on further sheets.
/// @param fontSize    points
/// @param linesToFit  lines that every page has room for
/// @param lines       lines that this page has
LinePlacement placeLines(double fontSize, const PdfPageBox &box, const FaceHeight &face, qsizetype linesToFit,
                         qsizetype lines);

/// The cells that fit side by side in a box.
qint64 cellsAcross(const PdfPageBox &box, int cell, double fontSize);

/// The type size for rows of so many cells: the given one or, where they are wider than the box, the one that they fit it
/// with, but not below `smallestType`.
/// @param cell  the advance of a cell, in thousandths of the font size
double sizeForCells(const PdfPageBox &box, int cell, double fontSize, qint64 cells);

} // namespace kareport
