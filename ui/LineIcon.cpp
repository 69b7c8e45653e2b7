#include "LineIcon.h"

#include "Contrast.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>

#include <utility>

namespace kareport
{

namespace
{

class LineIconEngine : public QIconEngine
{
public:
    explicit LineIconEngine(DrawIcon draw) : draw_(std::move(draw)) {}

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State /*state*/) override
    {
        const QPalette palette = QGuiApplication::palette();
        const auto group = mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active;
        // A highlight that does not show on the background, such as dark blue on dark grey, is replaced by the text's
        // colour.
        QColor accent = palette.color(group, QPalette::Highlight);
        if (contrast(accent, palette.color(group, QPalette::Button)) < leastShapeContrast) {
            accent = palette.color(group, QPalette::ButtonText);
        }
        if (mode == QIcon::Disabled) {
            accent = palette.color(group, QPalette::Mid);
        }
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->translate(rect.topLeft());
        painter->scale(rect.width() / iconSheet, rect.height() / iconSheet);
        painter->setPen(QPen(palette.color(group, QPalette::ButtonText), iconLineWidth, Qt::SolidLine, Qt::RoundCap,
                             Qt::MiterJoin));
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

    QIconEngine *clone() const override { return new LineIconEngine(*this); }

private:
    DrawIcon draw_;
};

} // namespace

QIcon lineIcon(DrawIcon draw)
{
    return QIcon(new LineIconEngine(std::move(draw)));
}

} // namespace kareport
