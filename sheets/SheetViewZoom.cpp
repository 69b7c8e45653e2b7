// How large the sheets are shown, and what stays where it is while that changes.
#include "PrintGeometry.h"
#include "SheetLayout.h"
#include "SheetView.h"
#include "ValueGuard.h"

#include <QScrollBar>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int zoomSteps[] = {10, 15, 25, 33, 50, 67, 75, 90, 100, 125, 150, 200, 250, 300, 400, 500};

} // namespace

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

} // namespace kareport
