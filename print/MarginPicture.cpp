#include "MarginPicture.h"

#include "FixedPitchFont.h"
#include "PageMeasurement.h"
#include "PageUnits.h"
#include "PrintGeometry.h"

#include <QFontMetricsF>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

constexpr int fontPoints = 10;
constexpr int farEnd = 10'000; // beyond every sheet

/// A fixed-pitch font whose lines are `height` dots high.
QFont markFont(QPaintDevice &device, int height)
{
    QFont font = fixedPitchFont(QStringLiteral("Courier New"));
    font.setPixelSize(std::max(1, height));
    const QFontMetricsF metrics(font, &device);
    const qreal line = metrics.ascent() + metrics.descent();
    font.setPixelSize(std::max(1, static_cast<int>(std::lround(height * height / line))));
    return font;
}

} // namespace

void drawMargins(QPainter &painter, const QRect &twips)
{
    QPaintDevice *device = painter.device();
    if (device == nullptr) {
        return;
    }
    const QFont fontBefore = painter.font();
    const QPen penBefore = painter.pen();
    const QFont font = markFont(*device, mulDiv(fontPoints, device->logicalDpiX(), pointsPerInch));
    painter.setFont(font);
    const auto x = [device](int value) { return mulDiv(value, device->logicalDpiX(), twipsPerInch); };
    const auto y = [device](int value) { return mulDiv(value, device->logicalDpiY(), twipsPerInch); };
    const int left = x(twips.x());
    const int top = y(twips.y());
    const int right = x(twips.x() + twips.width());
    const int bottom = y(twips.y() + twips.height());

    painter.setPen(QPen(penBefore.color(), 0, Qt::DotLine));
    painter.drawLine(0, top, farEnd, top);
    painter.drawLine(left, 0, left, farEnd);
    painter.drawLine(0, bottom, farEnd, bottom);
    painter.drawLine(right, 0, right, farEnd);

    const QFontMetricsF metrics(font, device);
    const int ascent = static_cast<int>(std::lround(metrics.ascent()));
    const int lineHeight = std::max(1, ascent + static_cast<int>(std::lround(metrics.descent())));
    const int count = (bottom - top) / lineHeight;
    for (int i = 0; i < count; ++i) {
        const int line = top + i * lineHeight;
        painter.drawLine(left, line, farEnd, line);
        painter.drawText(left, line + ascent, QStringLiteral("%1->>").arg(i));
    }
    painter.setPen(penBefore);
    painter.setFont(fontBefore);
}

} // namespace kareport
