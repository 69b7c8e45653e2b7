#include "PdfGeometry.h"

#include "PageFit.h"
#include "PageUnits.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The smallest distance and size that the numbers of a PDF can still say.
constexpr double smallest = 0.01;
/// The smallest distance of lines, in font heights: closer, and descenders would run into what is below.
constexpr double closest = 0.75;
/// What the last place of a calculation may take from a number of lines or cells.
constexpr double rounding = 1e-4;

double marginPoints(int margin)
{
    return static_cast<double>(qint64(margin) * pointsPerInch) / hundredthsPerInch;
}

} // namespace

PdfPageBox pdfPageBox(const PdfPageSetup &setup)
{
    const double width = double(setup.pageSize.width()) * pointsPerInch / setup.resolution;
    const double height = double(setup.pageSize.height()) * pointsPerInch / setup.resolution;
    PdfPageBox box;
    box.width = static_cast<float>(width);
    box.height = static_cast<float>(height);
    box.left = static_cast<float>(marginPoints(setup.margins.left()));
    box.top = static_cast<float>(height - marginPoints(setup.margins.top()));
    box.right = static_cast<float>(width - marginPoints(setup.margins.right()));
    box.bottom = static_cast<float>(marginPoints(setup.margins.bottom()));
    return box;
}

qsizetype linesToFit(const PdfPageSetup &setup, const PdfPageBox &box, const FaceHeight &face, qsizetype linesOfReport)
{
    const qsizetype lines = setup.linesPerPage;
    const LinePlacement placement = placeLines(setup.fontSize, box, face, lines, lines);
    return placement.leading < static_cast<float>(closest * setup.fontSize) || placement.lines < lines
               ? std::clamp<qsizetype>(linesOfReport, 1, lines)
               : lines;
}

LinePlacement placeLines(double fontSize, const PdfPageBox &box, const FaceHeight &face, qsizetype linesToFit,
                         qsizetype lines)
{
    const double least = std::min(fontSize, smallestType);
    const double boxHeight = std::max(smallest, double(box.top) - double(box.bottom));
    const double faceHeight = (double(face.ascent) - double(face.descent)) / 1000;
    const auto gaps = static_cast<double>(std::max<qsizetype>(linesToFit, 1) - 1);
    double size = fontSize;
    double leading = faceHeight * size;
    if (gaps > 0) {
        leading = std::min(leading, (boxHeight - leading) / gaps);
    }
    if (leading < closest * size) {
        size = std::max(least, std::min(size, boxHeight / (gaps + faceHeight / closest) / closest));
        leading = closest * size;
    }
    if (lines > linesToFit) {
        const double needed = leading * static_cast<double>(lines - 1) + faceHeight * size;
        const double scale = std::max(least / size, std::min(1.0, boxHeight / needed));
        leading *= scale;
        size *= scale;
    }
    LinePlacement placement;
    placement.fontSize = static_cast<float>(std::max(smallest, size));
    placement.leading = static_cast<float>(std::max(smallest, leading));
    placement.firstBaseline =
        static_cast<float>(double(box.top) - double(face.ascent) / 1000 * double(placement.fontSize));
    const double room = (boxHeight - faceHeight * size) / leading + rounding;
    placement.lines = room < 0 ? 1 : 1 + static_cast<qsizetype>(std::min(room, double(std::max(lines, linesToFit))));
    return placement;
}

qint64 cellsAcross(const PdfPageBox &box, int cell, double fontSize)
{
    const double width = (double(box.right) - double(box.left)) * 1000 / fontSize;
    return std::max<qint64>(1, static_cast<qint64>(width / cell + rounding));
}

double sizeForCells(const PdfPageBox &box, int cell, double fontSize, qint64 cells)
{
    const double width = (double(box.right) - double(box.left)) * 1000;
    const double fitting = cells > 0 ? width / (static_cast<double>(cells) * cell) : fontSize;
    return std::max(std::min(fontSize, smallestType), std::min(fontSize, fitting));
}

} // namespace kareport
