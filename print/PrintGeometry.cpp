#include "PrintGeometry.h"

#include "PageMeasurement.h"
#include "PageUnits.h"

#include <algorithm>
#include <climits>
#include <cmath>

namespace kareport
{

namespace
{

constexpr int leastRoom = 567; // twips: 10 mm

int twipsOfDots(int dots, unsigned resolution)
{
    // 32 bits without a sign, as sheets have always been converted: a sheet of 2,982,617 dots, 63 m at 1200 dpi, is the first
    // that does not come out.
    return resolution == 0 ? 0 : static_cast<int>(static_cast<unsigned>(dots) * twipsPerInch / resolution);
}

int difference(int whole, int first, int second)
{
    return static_cast<int>(std::clamp<qint64>(qint64(whole) - first - second, INT_MIN, INT_MAX));
}

} // namespace

int twipsOfHundredths(int hundredths)
{
    return mulDiv(hundredths, twipsPerInch, hundredthsPerInch);
}

QMargins twipsOfHundredths(const QMargins &margins)
{
    return {twipsOfHundredths(margins.left()), twipsOfHundredths(margins.top()), twipsOfHundredths(margins.right()),
            twipsOfHundredths(margins.bottom())};
}

QSize twipsOfDots(const QSize &sheet, unsigned resolution)
{
    return {twipsOfDots(sheet.width(), resolution), twipsOfDots(sheet.height(), resolution)};
}

int twipsOfMillimetres(qreal millimetres)
{
    return static_cast<int>(std::lround(millimetres * twipsPerInch / millimetresPerInch));
}

int expectedPages(int lines, int linesPerPage)
{
    if (linesPerPage == 0) {
        return 0;
    }
    const qint64 pages = (qint64(lines) - 1 + linesPerPage) / linesPerPage;
    return static_cast<int>(std::clamp<qint64>(pages, INT_MIN, INT_MAX));
}

QRect printableRect(const QSize &sheet, const QMargins &margins)
{
    return {margins.left(), margins.top(), difference(sheet.width(), margins.left(), margins.right()),
            difference(sheet.height(), margins.top(), margins.bottom())};
}

bool leavesRoom(const QSize &sheet, const QMargins &margins)
{
    const QRect rect = printableRect(sheet, margins);
    return rect.width() >= leastRoom && rect.height() >= leastRoom;
}

} // namespace kareport
