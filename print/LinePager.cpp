#include "LinePager.h"

#include "PageRows.h"
#include "PageUnits.h"
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

/// What roundings may have taken from a height.
qreal roundingOf(int resolution)
{
    return dotsOf(1, resolution) * lostTwips + lostDots;
}

/// The height of a page of `lines` lines where roundings are all that keeps it from them.
qreal settledHeight(qreal height, int lineHeight, int lines, qreal rounding)
{
    const qreal usual = qreal(lines) * lineHeight;
    const bool lacksRounding = height < usual && height + rounding >= usual;
    const bool exceedsByRounding = height >= usual + lineHeight && height - rounding < usual + lineHeight;
    return lines > 0 && (lacksRounding || exceedsByRounding) ? usual : height;
}

/// From the dots of the type's own size to those of the sheet.
void putOnSheet(std::vector<PageRow> &places, QPointF corner, qreal scale)
{
    for (PageRow &row : places) {
        row.top = corner.y() + row.top * scale;
        row.height *= scale;
        for (qreal &edge : row.edges) {
            edge = corner.x() + edge * scale;
        }
    }
}

} // namespace

LinePager::LinePager(const QTextDocument &text, QPaintDevice &device)
    : text_(text), device_(device), faces_(text, device)
{}

qint64 LinePager::length() const
{
    return text_.characterCount() - 1;
}

SheetRoom LinePager::room(const QRect &twips) const
{
    const qreal rounding = roundingOf(device_.logicalDpiY());
    return {dotsOf(twips.width(), device_.logicalDpiX()) + rounding,
            dotsOf(twips.height(), device_.logicalDpiY()) + rounding};
}

qint64 LinePager::layOut(const QRect &twips, qint64 start, qint64 stop, QPainter *painter, std::vector<PageRow> *places)
{
    const qint64 end = stop < 0 ? length() : std::min(stop, length());
    if (start < 0 || start >= end || twips.isEmpty()) {
        return start;
    }
    const int resolution = device_.logicalDpiY();
    PageArea area;
    area.left = std::round(dotsOf(twips.x(), device_.logicalDpiX()));
    area.top = std::round(dotsOf(twips.y(), resolution));
    area.width = room(twips).width;
    area.height =
        settledHeight(dotsOf(twips.height(), resolution), faces_.base().height, usualLines_, roundingOf(resolution));
    return layOutIn(area, start, end, painter, places);
}

qint64 LinePager::layOutScaled(const QRect &twips, qint64 start, qint64 stop, qreal scale, QPainter *painter,
                               std::vector<PageRow> *places)
{
    const qint64 end = stop < 0 ? length() : std::min(stop, length());
    if (start < 0 || start >= end || twips.isEmpty() || scale <= 0) {
        return start;
    }
    // In dots of the type's own size, so that rows break in the same places at every size.
    const SheetRoom sheet = room(twips);
    PageArea area;
    area.width = sheet.width / scale + lostDots;
    area.height = sheet.height / scale + lostDots;
    const QPointF corner(std::round(dotsOf(twips.x(), device_.logicalDpiX())),
                         std::round(dotsOf(twips.y(), device_.logicalDpiY())));
    if (painter != nullptr) {
        painter->save();
        painter->translate(corner);
        painter->scale(scale, scale);
    }
    const qint64 next = layOutIn(area, start, end, painter, places);
    if (painter != nullptr) {
        painter->restore();
    }
    if (places != nullptr) {
        putOnSheet(*places, corner, scale);
    }
    return next;
}

qint64 LinePager::layOutIn(const PageArea &area, qint64 start, qint64 end, QPainter *painter,
                           std::vector<PageRow> *places)
{
    PageRows rows(text_, faces_, device_, area, painter, places);
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

PageText LinePager::measure(qint64 start, qint64 stop)
{
    PageText page;
    const int resolution = device_.logicalDpiY();
    page.points = static_cast<double>(faces_.base().font.pixelSize()) * pointsPerInch / resolution;
    PageRows rows(text_, faces_, device_, PageArea(), nullptr);
    qreal height = 0;
    for (QTextBlock block = text_.findBlock(static_cast<int>(start)); block.isValid() && block.position() < stop;
         block = block.next())
    {
        const PageRows::LineSize line = rows.measureLine(block);
        page.widestRow = std::max(page.widestRow, line.width);
        height += line.height;
        ++page.rows;
    }
    page.rowHeight = page.rows > 0 ? height / static_cast<double>(page.rows) : 0;
    return page;
}

} // namespace kareport
