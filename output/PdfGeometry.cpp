#include "PdfGeometry.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr double pointsPerInch = 72;
constexpr double hundredthsPerInch = 2540;
/// The smallest distance and size that the numbers of a PDF can still say.
constexpr double smallest = 0.01;
/// The closest that lines stand, in font heights: closer, and descenders would run into what is below.
constexpr double closest = 0.75;

double marginPoints(int margin)
{
    return static_cast<double>(qint64(margin) * 72) / hundredthsPerInch;
}

} // namespace

PdfPageBox pdfPageBox(const PdfPageSetup &setup)
{
    const double width = setup.pageSize.width() * pointsPerInch / setup.resolution;
    const double height = setup.pageSize.height() * pointsPerInch / setup.resolution;
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
    return placeLines(setup, box, face, lines, lines).leading < static_cast<float>(closest * setup.fontSize)
               ? std::clamp<qsizetype>(linesOfReport, 1, lines)
               : lines;
}

LinePlacement placeLines(const PdfPageSetup &setup, const PdfPageBox &box, const FaceHeight &face, qsizetype linesToFit,
                         qsizetype lines)
{
    const double boxHeight = std::max(smallest, double(box.top) - double(box.bottom));
    const double faceHeight = (double(face.ascent) - double(face.descent)) / 1000;
    const auto gaps = static_cast<double>(std::max<qsizetype>(linesToFit, 1) - 1);
    double size = setup.fontSize;
    double leading = faceHeight * size;
    if (gaps > 0) {
        leading = std::min(leading, (boxHeight - leading) / gaps);
    }
    if (leading < closest * size) {
        leading = std::min(closest * size, boxHeight / (gaps + faceHeight / closest));
        size = leading / closest;
    }
    if (lines > linesToFit) {
        const double needed = leading * static_cast<double>(lines - 1) + faceHeight * size;
        const double scale = std::min(1.0, boxHeight / needed);
        leading *= scale;
        size *= scale;
    }
    LinePlacement placement;
    placement.fontSize = static_cast<float>(std::max(smallest, size));
    placement.leading = static_cast<float>(std::max(smallest, leading));
    placement.firstBaseline =
        static_cast<float>(double(box.top) - double(face.ascent) / 1000 * double(placement.fontSize));
    return placement;
}

} // namespace kareport
