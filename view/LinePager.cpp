#include "LinePager.h"

#include "PageRows.h"
#include "PrintFaces.h"
#include "PrintGeometry.h"

#include <QPaintDevice>
#include <QPainter>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// What the conversions of a sheet and its margins may take from a length: two margins rounded twice, the sheet cut off.
constexpr qreal lostTwips = 2;
constexpr qreal lostDots = 1;

qreal dotsOf(int twips, int resolution)
{
    return qreal(twips) * resolution / twipsPerInch;
}

/// The height of a page of `lines` lines where roundings are all that keeps it from them.
qreal settledHeight(qreal height, int lineHeight, int lines, qreal rounding)
{
    const qreal usual = qreal(lines) * lineHeight;
    const bool lacksRounding = height < usual && height + rounding >= usual;
    const bool exceedsByRounding = height >= usual + lineHeight && height - rounding < usual + lineHeight;
    return lines > 0 && (lacksRounding || exceedsByRounding) ? usual : height;
}

} // namespace

LinePager::LinePager(const QTextDocument &text, QPaintDevice &device) : text_(text), device_(device) {}

qint64 LinePager::length() const
{
    return text_.characterCount() - 1;
}

qint64 LinePager::layOut(const QRect &twips, qint64 start, qint64 stop, QPainter *painter) const
{
    const qint64 end = stop < 0 ? length() : std::min(stop, length());
    if (start < 0 || start >= end || twips.isEmpty()) {
        return start;
    }
    const int resolution = device_.logicalDpiY();
    const qreal rounding = dotsOf(1, resolution) * lostTwips + lostDots;
    PrintFaces faces(text_, device_);
    PageArea area;
    area.left = std::round(dotsOf(twips.x(), device_.logicalDpiX()));
    area.top = std::round(dotsOf(twips.y(), resolution));
    area.width = dotsOf(twips.width(), device_.logicalDpiX()) + rounding;
    area.height = settledHeight(dotsOf(twips.height(), resolution), faces.base().height, usualLines_, rounding);

    PageRows rows(text_, faces, device_, area, painter);
    QTextBlock block = text_.findBlock(static_cast<int>(start));
    qint64 next = start;
    while (next < end) {
        const int stopInBlock = static_cast<int>(std::min<qint64>(end - block.position(), block.length() - 1));
        const int reached = rows.addLine(block, static_cast<int>(next - block.position()), stopInBlock);
        if (reached < stopInBlock || rows.isFull()) {
            return block.position() + reached;
        }
        block = block.next();
        next = block.isValid() ? block.position() : end;
    }
    return std::min(next, end);
}

} // namespace kareport
