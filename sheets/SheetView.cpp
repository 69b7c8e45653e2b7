#include "SheetView.h"

#include "PrintGeometry.h"
#include "SheetLayout.h"
#include "SheetMarks.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QPainter>
#include <QScrollBar>

#include <algorithm>
#include <cmath>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int zoomSteps[] = {10, 15, 25, 33, 50, 67, 75, 90, 100, 125, 150, 200, 250, 300, 400, 500};
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

double SheetView::pixelsPerTwip() const
{
    const SheetLayout *sheets = layout();
    const double natural = double(logicalDpiX()) / twipsPerInch;
    if (fit_ == Fit::None || sheets == nullptr || sheets->paper().size.isEmpty()) {
        return natural * zoom_ / 100;
    }
    const QSize paper = sheets->paper().size;
    const int around = 2 * gap();
    const double byWidth = double(viewport()->width() - around) / paper.width();
    const double byHeight = double(viewport()->height() - around) / paper.height();
    const double fitting = fit_ == Fit::Width ? byWidth : std::min(byWidth, byHeight);
    return std::clamp(fitting, natural * zoomSteps[0] / 100, natural * *std::rbegin(zoomSteps) / 100);
}

QSize SheetView::sheetSize() const
{
    const SheetLayout *sheets = layout();
    const QSize paper = sheets != nullptr ? sheets->paper().size : QSize();
    const double scale = pixelsPerTwip();
    return {std::max(1, qRound(paper.width() * scale)), std::max(1, qRound(paper.height() * scale))};
}

int SheetView::zoomPercent() const
{
    return qRound(pixelsPerTwip() * twipsPerInch * 100 / logicalDpiX());
}

SheetView::Held SheetView::hold(QPoint point) const
{
    const QSize size = sheetSize();
    Held held;
    held.point = point;
    held.sheet = std::max(0, std::min(count() - 1, (point.y() + verticalScrollBar()->value()) / pitch()));
    const QRect rect = sheetRect(held.sheet);
    held.above = std::max(0, rect.top() - point.y());
    held.down = double(std::max(0, point.y() - rect.top())) / size.height();
    held.right = double(point.x() - rect.left()) / size.width();
    return held;
}

void SheetView::holdTop()
{
    if (!isKeeping_ && count() > 0) {
        held_ = hold(QPoint(0, 0));
    }
}

void SheetView::keep(const std::optional<Held> &wanted)
{
    if (count() == 0 || !wanted) {
        return;
    }
    const Held held = *wanted; // scrolling notes another one
    const ValueGuard keeping(isKeeping_, true, [this](bool on) { isKeeping_ = on; });
    const QSize size = sheetSize();
    const QRect rect = sheetRect(held.sheet);
    const int top = rect.top() + qRound(held.down * size.height()) - held.above;
    const int left = rect.left() + qRound(held.right * size.width());
    verticalScrollBar()->setValue(verticalScrollBar()->value() + top - held.point.y());
    horizontalScrollBar()->setValue(horizontalScrollBar()->value() + left - held.point.x());
}

void SheetView::zoomAt(QPoint point, const std::function<void()> &change)
{
    const std::optional<Held> held = hold(point);
    change();
    setRanges();
    keep(held);
    holdTop();
    viewport()->update();
    lastShown_ = -1;
    noteShown();
}

void SheetView::setFit(Fit fit)
{
    const int sheet = shownSheet();
    zoomAt(QPoint(0, 0), [this, fit] {
        zoom_ = zoomPercent();
        fit_ = fit;
    });
    if (fit == Fit::Page && sheet >= 0) {
        goToSheet(sheet);
    }
}

void SheetView::setZoomPercent(int percent)
{
    const QPoint middle(viewport()->width() / 2, viewport()->height() / 3);
    zoomAt(middle, [this, percent] {
        fit_ = Fit::None;
        zoom_ = std::clamp(percent, zoomSteps[0], *std::rbegin(zoomSteps));
    });
}

void SheetView::zoomStep(int direction)
{
    const int zoom = zoomPercent();
    const auto *next = direction > 0 ? std::upper_bound(std::begin(zoomSteps), std::end(zoomSteps), zoom)
                                     : std::lower_bound(std::begin(zoomSteps), std::end(zoomSteps), zoom);
    if (direction > 0 ? next != std::end(zoomSteps) : next != std::begin(zoomSteps)) {
        setZoomPercent(direction > 0 ? *next : *(next - 1));
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
            painter.fillRect(QRectF(std::round(cursor.left()), cursor.top(), hasFocus() ? 2 : 1, cursor.height()),
                             palette().color(QPalette::Highlight));
        }
    }
}

} // namespace kareport
