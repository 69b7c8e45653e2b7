#include "LineIcon.h"
#include "ReportResources.h"

#include <QPainter>
#include <QPainterPath>

namespace kareport
{

namespace
{

using Draw = void (*)(QPainter &painter, const QColor &accent);

void drawDisk(QPainter &painter, const QColor &accent)
{
    QPainterPath outline;
    outline.moveTo(2.5, 2.5);
    outline.lineTo(11.5, 2.5);
    outline.lineTo(13.5, 4.5);
    outline.lineTo(13.5, 13.5);
    outline.lineTo(2.5, 13.5);
    outline.closeSubpath();
    painter.drawPath(outline);
    painter.fillRect(QRectF(5, 3, 5, 3.5), accent);
    painter.drawRect(QRectF(5, 9, 6, 4.5));
}

void drawPage(QPainter &painter, const QColor &accent)
{
    QPainterPath outline;
    outline.moveTo(3.5, 1.5);
    outline.lineTo(9.5, 1.5);
    outline.lineTo(12.5, 4.5);
    outline.lineTo(12.5, 14.5);
    outline.lineTo(3.5, 14.5);
    outline.closeSubpath();
    painter.drawPath(outline);
    painter.drawPolyline(QPolygonF({{9.5, 1.5}, {9.5, 4.5}, {12.5, 4.5}}));
    painter.setPen(QPen(accent, iconLineWidth));
    for (const qreal y : {7.5, 9.5, 11.5}) {
        painter.drawLine(QPointF(5.5, y), QPointF(10.5, y));
    }
}

void drawPrinter(QPainter &painter, const QColor &accent)
{
    painter.drawRect(QRectF(4.5, 1.5, 7, 4));
    painter.drawRoundedRect(QRectF(1.5, 5.5, 13, 6), 1, 1);
    painter.setBrush(accent);
    painter.drawRect(QRectF(4.5, 9.5, 7, 5));
}

Draw drawingOf(unsigned command)
{
    switch (command) {
    case commandSaveReport: return &drawDisk;
    case commandShowReport: return &drawPage;
    case commandPrintReport: return &drawPrinter;
    default: return nullptr;
    }
}

} // namespace

QIcon reportIcon(unsigned command)
{
    const Draw draw = drawingOf(command);
    return draw != nullptr ? lineIcon(draw) : QIcon();
}

} // namespace kareport
