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

LinePlacement placeLines(const PdfPageSetup &setup, const PdfPageBox &box, const FaceHeight &face, qsizetype lines)
{
    const double size = setup.fontSize;
    const double boxHeight = std::max(smallest, double(box.top) - double(box.bottom));
    const double lineHeight = (double(face.ascent) - double(face.descent)) / 1000 * size;
    double leading = lineHeight;
    if (setup.linesPerPage > 1) {
        leading =
            std::clamp((boxHeight - lineHeight) / (setup.linesPerPage - 1), std::min(smallest, lineHeight), lineHeight);
    }
    const double needed = leading * static_cast<double>(std::max<qsizetype>(lines, 1) - 1) + lineHeight;
    const bool isBroken = lines > setup.linesPerPage;
    const double scale = isBroken && needed > boxHeight ? boxHeight / needed : 1;

    LinePlacement placement;
    placement.fontSize = static_cast<float>(scale < 1 ? std::max(smallest, size * scale) : size);
    placement.leading = static_cast<float>(scale < 1 ? std::max(smallest, leading * scale) : leading);
    placement.firstBaseline =
        static_cast<float>(double(box.top) - double(face.ascent) / 1000 * double(placement.fontSize));
    return placement;
}

} // namespace kareport
