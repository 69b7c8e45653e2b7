// How the list lays its rows out: they are all of one height, so that every place in it is a matter of arithmetic and none
// of it is kept for each row.

#include "LineWidth.h"
#include "UReportList.h"

#include "ReportLines.h"

#include <QPaintEvent>
#include <QScrollBar>
#include <QStyleOptionViewItem>
#include <QStylePainter>

#include <algorithm>
#include <limits>

namespace
{

int bounded(qint64 pixels)
{
    return static_cast<int>(std::min<qint64>(pixels, std::numeric_limits<int>::max()));
}

} // namespace

int UReportList::contentWidth() const
{
    const int margin = style()->pixelMetric(QStyle::PM_FocusFrameHMargin, nullptr, this) + 1;
    return extent_ + 2 * margin;
}

int UReportList::rowAt(int y) const
{
    return bounded((qint64(y) + verticalOffset()) / rowHeight_);
}

QRect UReportList::rowsRect(int first, int last) const
{
    const qint64 top = qint64(first) * rowHeight_ - verticalOffset();
    return {-horizontalOffset(), bounded(top), std::max(contentWidth(), viewport()->width()),
            bounded((qint64(last) - first + 1) * rowHeight_)};
}

QRect UReportList::visualRect(const QModelIndex &index) const
{
    return index.isValid() ? rowsRect(index.row(), index.row()) : QRect();
}

QModelIndex UReportList::indexAt(const QPoint &point) const
{
    return point.y() < 0 ? QModelIndex() : lines_->index(rowAt(point.y()));
}

void UReportList::scrollTo(const QModelIndex &index, ScrollHint hint)
{
    if (!index.isValid()) {
        return;
    }
    executeDelayedItemsLayout();
    const qint64 top = qint64(index.row()) * rowHeight_;
    const int page = viewport()->height();
    const qint64 last = top + rowHeight_ - page; // the offset that has the row at the bottom
    const bool isAbove = top < verticalOffset();
    const bool isBelow = last > verticalOffset();
    switch (hint) {
    case PositionAtTop: verticalScrollBar()->setValue(bounded(top)); break;
    case PositionAtBottom: verticalScrollBar()->setValue(bounded(last)); break;
    case PositionAtCenter: verticalScrollBar()->setValue(bounded((top + last) / 2)); break;
    case EnsureVisible:
        if (isAbove || rowHeight_ > page) {
            verticalScrollBar()->setValue(bounded(top));
        } else if (isBelow) {
            verticalScrollBar()->setValue(bounded(last));
        }
        break;
    }
}

void UReportList::doItemsLayout()
{
    QAbstractItemView::doItemsLayout(); // NOLINT(bugprone-parent-virtual-call): the one between lays out each row
}

void UReportList::updateGeometries()
{
    horizontalScrollBar()->setSingleStep(std::max(1, qRound(lineWidth_->characterWidth())));
    horizontalScrollBar()->setPageStep(viewport()->width());
    horizontalScrollBar()->setRange(0, std::max(0, contentWidth() - viewport()->width()));
    const int page = viewport()->height();
    verticalScrollBar()->setSingleStep(rowHeight_);
    verticalScrollBar()->setPageStep(page);
    verticalScrollBar()->setRange(0, bounded(std::max<qint64>(0, qint64(lines_->rowCount()) * rowHeight_ - page)));
    QAbstractItemView::updateGeometries(); // NOLINT(bugprone-parent-virtual-call): the one between sets other ranges
}

void UReportList::resizeEvent(QResizeEvent *event)
{
    // A user who watches the newest line still sees it when the horizontal bar appears and takes some of the height.
    QScrollBar *bar = verticalScrollBar();
    const bool showsEnd = bar->maximum() > 0 && bar->value() == bar->maximum();
    QListView::resizeEvent(event);
    if (showsEnd) {
        bar->setValue(bar->maximum());
    }
}

int UReportList::horizontalOffset() const
{
    return horizontalScrollBar()->value();
}

int UReportList::verticalOffset() const
{
    return verticalScrollBar()->value();
}

void UReportList::scrollContentsBy(int dx, int dy)
{
    scrollDirtyRegion(dx, dy);
    viewport()->scroll(dx, dy);
}

bool UReportList::isIndexHidden(const QModelIndex & /*index*/) const
{
    return false;
}

QModelIndex UReportList::moveCursor(CursorAction action, Qt::KeyboardModifiers /*modifiers*/)
{
    const int last = lines_->rowCount() - 1;
    const int page = std::max(1, viewport()->height() / rowHeight_ - 1);
    int row = currentIndex().row();
    switch (action) {
    case MoveUp:
    case MovePrevious: row -= 1; break;
    case MoveDown:
    case MoveNext: row += 1; break;
    case MoveHome: row = 0; break;
    case MoveEnd: row = last; break;
    case MovePageUp: row -= page; break;
    case MovePageDown: row = std::max(row, 0) + page; break;
    case MoveLeft:
    case MoveRight: break;
    }
    return last < 0 ? QModelIndex() : lines_->index(std::clamp(row, 0, last));
}

void UReportList::setSelection(const QRect &rect, QItemSelectionModel::SelectionFlags command)
{
    const QModelIndex index = indexAt(rect.center());
    selectionModel()->select(index.isValid() ? QItemSelection(index, index) : QItemSelection(), command);
}

QRegion UReportList::visualRegionForSelection(const QItemSelection &selection) const
{
    QRegion region;
    for (const QItemSelectionRange &range : selection) {
        region += rowsRect(range.top(), range.bottom()) & viewport()->rect();
    }
    return region;
}

void UReportList::paintEvent(QPaintEvent *event)
{
    QStylePainter painter(viewport());
    QStyleOptionViewItem option;
    initViewItemOption(&option);
    option.widget = this;
    option.features |= QStyleOptionViewItem::HasDisplay;
    option.displayAlignment = Qt::AlignLeft | Qt::AlignVCenter;
    option.showDecorationSelected = true;
    const QStyle::State plain = option.state & ~(QStyle::State_HasFocus | QStyle::State_Selected);
    const int last = std::min(rowAt(event->rect().bottom()), lines_->rowCount() - 1);
    for (int row = rowAt(event->rect().top()); row <= last; ++row) {
        const QModelIndex index = lines_->index(row);
        option.index = index;
        option.rect = rowsRect(row, row);
        option.text = kareport::shownLine(lines_->line(row));
        option.state = plain;
        option.state.setFlag(QStyle::State_Selected, selectionModel()->isSelected(index));
        option.state.setFlag(QStyle::State_HasFocus, hasFocus() && index == currentIndex());
        style()->drawControl(QStyle::CE_ItemViewItem, &option, &painter, this);
    }
}
