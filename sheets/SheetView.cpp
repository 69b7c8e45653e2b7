#include "SheetView.h"

#include "PrintGeometry.h"
#include "SheetLayout.h"
#include "SheetMarks.h"
#include "Xlate.h"

#include <QPainter>
#include <QScrollBar>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// Rows of more sheets than a window shows are not kept.
constexpr std::size_t mostRows = 16;

} // namespace

SheetView::SheetView(Source source, QWidget *parent) : SheetColumn(std::move(source), parent)
{
    setAccessibleName(Xlate("Sheets"));
    setFocusPolicy(Qt::StrongFocus);
    viewport()->setCursor(Qt::IBeamCursor);
}

void SheetView::sheetsChanged()
{
    forgetRows();
    setRanges();
    keep(held_);
    const SheetLayout *sheets = layout();
    setCurrent(sheets != nullptr ? sheets->sheetAt(position_) : -1);
    if (follows_) {
        setCursorPlace(anchor_, position_, true);
    }
    lastShown_ = -1;
    noteShown();
}

void SheetView::forgetRows()
{
    rows_.clear();
    viewport()->update();
}

void SheetView::setCurrent(int sheet)
{
    if (sheet != current()) {
        SheetColumn::setCurrent(sheet);
        setAccessibleDescription(sheet < 0 ? QString() : Xlate("Sheet %1 of %2").arg(sheet + 1).arg(count()));
    }
}

int SheetView::shownSheet() const
{
    if (count() == 0) {
        return -1;
    }
    const auto [first, last] = sheetsIn(viewport()->rect());
    const QRect rect = sheetRect(first);
    return rect.bottom() < rect.height() / 2 && first < last ? first + 1 : first;
}

void SheetView::goToSheet(int sheet)
{
    const int wanted = std::clamp(sheet, 0, std::max(0, count() - 1));
    verticalScrollBar()->setValue(wanted * pitch());
    noteShown();
}

void SheetView::noteShown()
{
    if (const int sheet = shownSheet(); sheet != lastShown_) {
        lastShown_ = sheet;
        if (shown_) {
            shown_();
        }
    }
}

const std::vector<PageRow> &SheetView::rowsOf(SheetLayout &layout, int sheet)
{
    if (const auto known = rows_.find(sheet); known != rows_.end()) {
        return known->second;
    }
    if (rows_.size() >= mostRows) {
        rows_.clear();
    }
    return rows_.emplace(sheet, layout.rows(sheet)).first->second;
}

QTransform SheetView::toViewport(const SheetLayout &layout, int sheet) const
{
    const QRect rect = sheetRect(sheet);
    const qreal dot = qreal(rect.width()) * twipsPerInch / layout.paper().size.width() / layout.paper().resolution;
    return QTransform(dot, 0, 0, dot, rect.left(), rect.top());
}

void SheetView::setCursorPlace(qint64 anchor, qint64 position, bool follows)
{
    follows = follows || (follows_ && position == position_); // as long as its sheet is not known
    anchor_ = anchor;
    position_ = position;
    follows_ = follows;
    viewport()->update();
    SheetLayout *sheets = layout();
    const int sheet = sheets != nullptr ? sheets->sheetAt(position) : -1;
    setCurrent(sheet);
    if (!follows || sheet < 0 || (!sheets->isDone() && sheet == sheets->count() - 1)) {
        return; // as soon as its sheet is known
    }
    follows_ = false;
    const QRect place = cursorRect().toAlignedRect();
    const QRect window = viewport()->rect().adjusted(0, gap(), 0, -gap());
    if (place.isNull()) {
        goToSheet(sheet);
        return;
    }
    if (place.top() < window.top() || place.bottom() > window.bottom()) {
        // In the upper third, where what follows it is in sight.
        verticalScrollBar()->setValue(verticalScrollBar()->value() + place.top() - window.height() / 3);
    }
    if (place.left() < 0 || place.right() > window.right()) {
        horizontalScrollBar()->setValue(horizontalScrollBar()->value() + place.left() - window.width() / 3);
    }
    noteShown();
}

QRectF SheetView::cursorRect()
{
    SheetLayout *sheets = layout();
    const int sheet = sheets != nullptr ? sheets->sheetAt(position_) : -1;
    if (sheet < 0) {
        return {};
    }
    const QRectF place = kareport::cursorRect(rowsOf(*sheets, sheet), position_);
    return place.height() > 0 ? toViewport(*sheets, sheet).mapRect(place) : QRectF();
}

qint64 SheetView::positionAt(QPoint point)
{
    SheetLayout *sheets = layout();
    const auto [first, last] = sheetsIn(QRect(point, QSize(1, 1)));
    if (sheets == nullptr || first > last || !sheetRect(first).contains(point)) {
        return -1;
    }
    const qint64 position =
        kareport::positionAt(rowsOf(*sheets, first), toViewport(*sheets, first).inverted().map(QPointF(point)));
    return position >= 0 ? position : sheets->sheets()[static_cast<std::size_t>(first)].start;
}

void SheetView::setSearch(const TextSearch &search)
{
    search_ = search;
    viewport()->update();
}

void SheetView::drawSheet(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect)
{
    const PrintSheet &shown = layout.sheets()[static_cast<std::size_t>(sheet)];
    const qint64 start = std::min(anchor_, position_);
    const qint64 stop = std::max(anchor_, position_);
    const bool isSelected = start < stop && start < shown.stop && stop > shown.start;
    const QTransform place = toViewport(layout, sheet);
    if (!search_.isEmpty()) {
        for (const QRectF &found : rectsOf(rowsOf(layout, sheet), layout.text(), search_)) {
            painter.fillRect(place.mapRect(found), QColor(255, 224, 102));
        }
    }
    if (isSelected) {
        QColor selected = palette().color(QPalette::Highlight);
        selected.setAlpha(110); // the text stays black
        for (const QRectF &part : rectsOf(rowsOf(layout, sheet), start, stop)) {
            painter.fillRect(place.mapRect(part), selected);
        }
    }
    drawText(painter, layout, sheet, rect);
    if (sheet == current()) {
        const QRectF cursor = place.mapRect(kareport::cursorRect(rowsOf(layout, sheet), position_));
        if (cursor.height() > 0) {
            // Before the character, not on it.
            const int width = hasFocus() ? 2 : 1;
            painter.fillRect(QRectF(std::round(cursor.left()) - width, cursor.top(), width, cursor.height()),
                             palette().color(QPalette::Highlight));
        }
    }
}

} // namespace kareport
