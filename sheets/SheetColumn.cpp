#include "SheetColumn.h"

#include "PrintGeometry.h"
#include "SheetLayout.h"

#include <QPaintEvent>
#include <QPainter>
#include <QScrollBar>

#include <algorithm>

namespace kareport
{

namespace
{

bool isDark(const QPalette &palette)
{
    return palette.color(QPalette::Base).lightness() < palette.color(QPalette::Text).lightness();
}

} // namespace

SheetColumn::SheetColumn(Source source, QWidget *parent) : QAbstractScrollArea(parent), source_(std::move(source))
{
    setFrameShape(QFrame::NoFrame);
    viewport()->setAttribute(Qt::WA_OpaquePaintEvent);
}

void SheetColumn::leave()
{
    source_ = {};
}

int SheetColumn::count() const
{
    const SheetLayout *sheets = layout();
    return sheets != nullptr ? sheets->count() : 0;
}

void SheetColumn::setMessage(const QString &message)
{
    if (message != message_) {
        message_ = message;
        viewport()->update();
    }
}

void SheetColumn::sheetsChanged()
{
    setRanges();
    viewport()->update();
}

void SheetColumn::setCurrent(int sheet)
{
    if (sheet == current_) {
        return;
    }
    for (const int changed : {current_, sheet}) {
        if (changed >= 0) {
            viewport()->update(sheetRect(changed).adjusted(-gap(), -gap(), gap(), gap() + captionHeight()));
        }
    }
    current_ = sheet;
}

void SheetColumn::setRanges()
{
    if (layout() == nullptr) {
        return; // they come back where they were
    }
    const QSize size = sheetSize();
    const int height = count() * pitch() + gap();
    const int width = size.width() + 2 * gap();
    verticalScrollBar()->setPageStep(viewport()->height());
    verticalScrollBar()->setSingleStep(std::max(1, size.height() / 20));
    verticalScrollBar()->setRange(0, std::max(0, height - viewport()->height()));
    horizontalScrollBar()->setPageStep(viewport()->width());
    horizontalScrollBar()->setSingleStep(std::max(1, size.width() / 20));
    horizontalScrollBar()->setRange(0, std::max(0, width - viewport()->width()));
}

QRect SheetColumn::sheetRect(int sheet) const
{
    const QSize size = sheetSize();
    const int left = std::max(gap(), (viewport()->width() - size.width()) / 2) - horizontalScrollBar()->value();
    return {QPoint(left, gap() + sheet * pitch() - verticalScrollBar()->value()), size};
}

std::pair<int, int> SheetColumn::sheetsIn(const QRect &part) const
{
    const int top = part.top() + verticalScrollBar()->value() - gap();
    const int first = std::clamp(top / pitch(), 0, std::max(0, count() - 1));
    const int last = std::min(count() - 1, (top + part.height()) / pitch());
    return {first, last};
}

QColor SheetColumn::ground() const
{
    return isDark(palette()) ? QColor(43, 43, 46) : QColor(160, 160, 164);
}

QColor SheetColumn::frameOf(int sheet) const
{
    return sheet == current_   ? palette().color(QPalette::Highlight)
           : isDark(palette()) ? QColor(20, 20, 22)
                               : QColor(110, 110, 114);
}

void SheetColumn::drawText(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect)
{
    const SheetPaper &paper = layout.paper();
    painter.save();
    painter.setClipRect(rect, Qt::IntersectClip);
    painter.setRenderHints(QPainter::TextAntialiasing | QPainter::Antialiasing);
    painter.translate(rect.topLeft());
    const qreal dot = qreal(rect.width()) * twipsPerInch / paper.size.width() / paper.resolution;
    painter.scale(dot, dot);
    painter.setPen(Qt::black);
    layout.draw(painter, sheet);
    painter.restore();
}

void SheetColumn::paintEvent(QPaintEvent *event)
{
    QPainter painter(viewport());
    painter.fillRect(event->rect(), ground());
    SheetLayout *sheets = layout();
    if (sheets == nullptr || sheets->count() == 0) {
        painter.setPen(isDark(palette()) ? QColor(220, 220, 220) : QColor(20, 20, 20));
        painter.drawText(viewport()->rect().adjusted(gap(), gap(), -gap(), -gap()), Qt::AlignCenter | Qt::TextWordWrap,
                         message_);
        return;
    }
    const auto [first, last] = sheetsIn(event->rect());
    for (int sheet = first; sheet <= last; ++sheet) {
        const QRect rect = sheetRect(sheet);
        painter.fillRect(rect, Qt::white);
        drawSheet(painter, *sheets, sheet, rect);
        const int width = sheet == current_ ? 2 : 1;
        painter.setPen(QPen(frameOf(sheet), width, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(rect.adjusted(-1, -1, 0, 0));
    }
}

void SheetColumn::resizeEvent(QResizeEvent * /*event*/)
{
    setRanges();
}

void SheetColumn::scrollContentsBy(int dx, int dy)
{
    viewport()->scroll(dx, dy);
}

} // namespace kareport
