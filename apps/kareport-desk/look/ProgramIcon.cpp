#include "ProgramIcon.h"

#include "DeskResources.h"
#include "PathDrawing.h"

#include <QFile>
#include <QPainter>
#include <QXmlStreamReader>

#include <array>

namespace kareport
{

namespace
{

/// What an element of the drawing says of how it is painted, or inherits from the group around it.
struct Paint
{
    QString fill = QStringLiteral("black");
    QString stroke = QStringLiteral("none");
    qreal width = 1;

    void take(const QXmlStreamAttributes &attributes)
    {
        const auto set = [&attributes](QStringView name, QString &value) {
            if (attributes.hasAttribute(name.toString())) {
                value = attributes.value(name.toString()).toString();
            }
        };
        set(u"fill", fill);
        set(u"stroke", stroke);
        if (attributes.hasAttribute(QStringLiteral("stroke-width"))) {
            width = attributes.value(QStringLiteral("stroke-width")).toDouble();
        }
    }

    void draw(QPainter &painter, const QPainterPath &path) const
    {
        painter.setBrush(fill == u"none" ? QBrush() : QBrush(QColor(fill)));
        painter.setPen(stroke == u"none" ? QPen(Qt::NoPen)
                                         : QPen(QColor(stroke), width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter.drawPath(path);
    }
};

/// Draws what the file of the icon holds: groups, paths and circles. Line ends and corners are round.
void drawElements(QPainter &painter, QXmlStreamReader &xml, const Paint &outer)
{
    while (xml.readNextStartElement()) {
        Paint paint = outer;
        const QXmlStreamAttributes attributes = xml.attributes();
        const auto value = [&attributes](QLatin1StringView name) { return attributes.value(name).toDouble(); };
        paint.take(attributes);
        if (xml.name() == u"g") {
            drawElements(painter, xml, paint);
            continue;
        }
        if (xml.name() == u"path") {
            paint.draw(painter, pathOf(attributes.value(QLatin1StringView("d"))));
        } else if (xml.name() == u"circle") {
            QPainterPath circle;
            const qreal radius = value(QLatin1StringView("r"));
            circle.addEllipse(QPointF(value(QLatin1StringView("cx")), value(QLatin1StringView("cy"))), radius, radius);
            paint.draw(painter, circle);
        }
        xml.skipCurrentElement();
    }
}

} // namespace

void drawProgramIcon(QPainter &painter, const QRectF &square)
{
    initDeskResources();
    QFile file(QStringLiteral(":/kareport/kareport.svg"));
    QXmlStreamReader xml(&file);
    if (!file.open(QIODevice::ReadOnly) || !xml.readNextStartElement()) {
        return;
    }
    const QStringList box = xml.attributes().value(QLatin1StringView("viewBox")).toString().split(u' ');
    const qreal side = box.value(2).toDouble();
    if (side <= 0) {
        return;
    }
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(square.topLeft());
    painter.scale(square.width() / side, square.height() / side);
    drawElements(painter, xml, Paint());
    painter.restore();
}

QImage programPicture(int size)
{
    QImage picture(size, size, QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    drawProgramIcon(painter, QRectF(0, 0, size, size));
    return picture;
}

QIcon programIcon()
{
    QIcon drawn;
    for (const int size : programIconSizes) {
        drawn.addPixmap(QPixmap::fromImage(programPicture(size)));
    }
    return QIcon::fromTheme(QStringLiteral("kareport"), drawn);
}

} // namespace kareport
