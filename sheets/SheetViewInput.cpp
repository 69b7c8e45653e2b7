#include "SheetView.h"

#include "ValueGuard.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>
#include <QWheelEvent>

#include <optional>

namespace kareport
{

namespace
{

constexpr int wheelStep = 120;

/// What a key zooms by: 1, -1, 0 for the size on paper.
std::optional<int> zoomOfKey(const QKeyEvent &event)
{
    if ((event.modifiers() & ~(Qt::KeypadModifier | Qt::ShiftModifier)) != Qt::ControlModifier) {
        return std::nullopt;
    }
    switch (event.key()) {
    case Qt::Key_Plus:
    case Qt::Key_Equal: return 1;
    case Qt::Key_Minus: return -1;
    case Qt::Key_0: return 0;
    default: return std::nullopt;
    }
}

} // namespace

bool SheetView::event(QEvent *event)
{
    // These keys belong to the sheets also where a menu has them.
    if (event->type() == QEvent::ShortcutOverride && zoomOfKey(*static_cast<QKeyEvent *>(event))) {
        event->accept();
        return true;
    }
    return SheetColumn::event(event);
}

void SheetView::keyPressEvent(QKeyEvent *event)
{
    if (const auto zoom = zoomOfKey(*event)) {
        *zoom == 0 ? setZoomPercent(100) : zoomStep(*zoom);
        return;
    }
    QScrollBar &bar = *verticalScrollBar();
    const auto modifiers = event->modifiers() & ~(Qt::KeypadModifier | Qt::ControlModifier | Qt::ShiftModifier);
    if (modifiers != Qt::NoModifier) {
        SheetColumn::keyPressEvent(event);
        return;
    }
    const int window = fit_ == Fit::Page ? pitch() : viewport()->height() * 9 / 10;
    switch (event->key()) {
    case Qt::Key_PageDown: bar.setValue(bar.value() + window); break;
    case Qt::Key_PageUp: bar.setValue(bar.value() - window); break;
    case Qt::Key_Space:
        bar.setValue(bar.value() + (event->modifiers().testFlag(Qt::ShiftModifier) ? -window : window));
        break;
    case Qt::Key_Home: bar.setValue(0); break;
    case Qt::Key_End: bar.setValue(bar.maximum()); break;
    case Qt::Key_Down: bar.setValue(bar.value() + bar.singleStep()); break;
    case Qt::Key_Up: bar.setValue(bar.value() - bar.singleStep()); break;
    case Qt::Key_Left:
        horizontalScrollBar()->setValue(horizontalScrollBar()->value() - horizontalScrollBar()->singleStep());
        break;
    case Qt::Key_Right:
        horizontalScrollBar()->setValue(horizontalScrollBar()->value() + horizontalScrollBar()->singleStep());
        break;
    default: event->ignore(); // for the window around it
    }
}

void SheetView::wheelEvent(QWheelEvent *event)
{
    if (!event->modifiers().testFlag(Qt::ControlModifier)) {
        SheetColumn::wheelEvent(event);
        return;
    }
    // Fine wheels report less than a step at a time.
    wheel_ += event->angleDelta().y();
    for (; wheel_ >= wheelStep; wheel_ -= wheelStep) {
        zoomStep(1);
    }
    for (; wheel_ <= -wheelStep; wheel_ += wheelStep) {
        zoomStep(-1);
    }
    event->accept();
}

void SheetView::mousePressEvent(QMouseEvent *event)
{
    const qint64 position = event->button() == Qt::LeftButton ? positionAt(event->position().toPoint()) : -1;
    if (position >= 0 && placed_) {
        placed_(position, event->modifiers().testFlag(Qt::ShiftModifier));
    }
}

void SheetView::mouseMoveEvent(QMouseEvent *event)
{
    const qint64 position = event->buttons().testFlag(Qt::LeftButton) ? positionAt(event->position().toPoint()) : -1;
    if (position >= 0 && placed_) {
        placed_(position, true);
    }
}

void SheetView::mouseDoubleClickEvent(QMouseEvent *event)
{
    const qint64 position = event->button() == Qt::LeftButton ? positionAt(event->position().toPoint()) : -1;
    if (position >= 0 && placed_ && wordWanted_) {
        placed_(position, false);
        wordWanted_();
    }
}

void SheetView::focusInEvent(QFocusEvent *event)
{
    SheetColumn::focusInEvent(event);
    viewport()->update(); // the cursor is thicker now
    if (focused_) {
        focused_();
    }
}

void SheetView::resizeEvent(QResizeEvent *event)
{
    // The sheets may have another size now: what is at the top of the window stays there.
    {
        const ValueGuard keeping(isKeeping_, true, [this](bool on) { isKeeping_ = on; });
        SheetColumn::resizeEvent(event);
    }
    keep(held_);
    viewport()->update();
    lastShown_ = -1;
    noteShown();
}

void SheetView::scrollContentsBy(int dx, int dy)
{
    SheetColumn::scrollContentsBy(dx, dy);
    holdTop();
    noteShown();
}

} // namespace kareport
