#include "ReportResources.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPainterPath>
#include <QPalette>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// Icons are drawn on a sheet of 16 units a side.
constexpr qreal sheet = 16;
constexpr qreal lineWidth = 1;
/// The contrast required by the guidelines for accessible graphics.
constexpr qreal leastContrast = 3;

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
    painter.setPen(QPen(accent, lineWidth));
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

/// The perceived brightness of a colour, from 0 to 1.
qreal luminance(const QColor &color)
{
    const auto linear = [](qreal part) {
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

/// The contrast of two colours, from 1 to 21.
qreal contrast(const QColor &a, const QColor &b)
{
    const auto [low, high] = std::minmax({luminance(a), luminance(b)});
    return (high + 0.05) / (low + 0.05);
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

class LineIcon : public QIconEngine
{
public:
    explicit LineIcon(Draw draw) : draw_(draw) {}

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State /*state*/) override
    {
        const QPalette palette = QGuiApplication::palette();
        const auto group = mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active;
        // A highlight that does not show on the background, such as dark blue on dark grey, is replaced by the text's
        // colour.
        QColor accent = palette.color(group, QPalette::Highlight);
        if (contrast(accent, palette.color(group, QPalette::Button)) < leastContrast) {
            accent = palette.color(group, QPalette::ButtonText);
        }
        if (mode == QIcon::Disabled) {
            accent = palette.color(group, QPalette::Mid);
        }
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->translate(rect.topLeft());
        painter->scale(rect.width() / sheet, rect.height() / sheet);
        painter->setPen(
            QPen(palette.color(group, QPalette::ButtonText), lineWidth, Qt::SolidLine, Qt::RoundCap, Qt::MiterJoin));
        painter->setBrush(Qt::NoBrush);
        draw_(*painter, accent);
        painter->restore();
    }

    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override
    {
        QPixmap pixmap(size);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        paint(&painter, QRect(QPoint(), size), mode, state);
        return pixmap;
    }

    QIconEngine *clone() const override { return new LineIcon(*this); }

private:
    Draw draw_;
};

} // namespace

QIcon reportIcon(unsigned command)
{
    const Draw draw = drawingOf(command);
    return draw != nullptr ? QIcon(new LineIcon(draw)) : QIcon();
}

} // namespace kareport
