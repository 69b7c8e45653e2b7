#include "UReportList.h"

#include "LineWidth.h"
#include "MemoryLasts.h"
#include "ReportEdit.h"
#include "ReportLines.h"
#include "ReportResources.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QResizeEvent>
#include <QScrollBar>

#include <algorithm>

namespace
{

/// How long lines are collected before they are shown.
constexpr int flushInterval = 50; // milliseconds

/// The sides of a rectangle that lie outside it, as its right and bottom one count here.
int rightOf(const QRect &rect)
{
    return rect.x() + rect.width();
}

int bottomOf(const QRect &rect)
{
    return rect.y() + rect.height();
}

/// The position that a scroll bar goes to from its current one.
int positionAfter(unsigned code, int current, int position)
{
    switch (code) {
    case UReportList::lineBack: return current - 1;
    case UReportList::lineForward: return current + 1;
    case UReportList::thumbPosition:
    case UReportList::thumbTrack: return position;
    default: return current;
    }
}

} // namespace

UReportList::UReportList(QWidget *parent)
    : QListView(parent),
      lines_(new kareport::ReportLines(this)),
      lineWidth_(std::make_unique<kareport::LineWidth>(font(), viewport()))
{
    setModel(lines_);
    setUniformItemSizes(true);
    setEditTriggers(NoEditTriggers);
    setSelectionMode(SingleSelection);
    setTextElideMode(Qt::ElideNone);
    setVerticalScrollMode(ScrollPerPixel);
    setHorizontalScrollMode(ScrollPerPixel);
    // The bar that every report soon needs is there from the beginning: the lines do not move when it comes.
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setLayoutDirection(Qt::LeftToRight); // reports are laid out in columns from the left
    flushTimer_.setSingleShot(true);
    flushTimer_.setInterval(flushInterval);
    connect(&flushTimer_, &QTimer::timeout, this, &UReportList::flush);
    measureAgain();
}

UReportList::~UReportList() = default;

bool UReportList::Create(QWidget *parent, const QRect &rect, int id)
{
    if (parent == nullptr) {
        return false;
    }
    setParent(parent);
    if (!testAttribute(Qt::WA_SetFont)) {
        setFont(kareport::reportDialog(kareport::reportWindowDialog).font());
    }
    setFrameStyle(QFrame::StyledPanel | QFrame::Sunken);
    setGeometry(rect);
    id_ = id;
    isCreated_ = true;
    show();
    // A list whose parent is not shown yet would be laid out only then.
    QResizeEvent laidOut(size(), size());
    QCoreApplication::sendEvent(this, &laidOut);
    contentRect_ = viewport()->rect();
    return true;
}

void UReportList::WriteLine(QStringView line)
{
    const int row = AddString(line);
    newest_ = row >= 0 ? row : newest_;
}

int UReportList::AddString(QStringView line)
{
    if (!lines_->append(line)) {
        return -1;
    }
    extent_ = std::max(extent_, lineWidth_->of(line));
    if (!flushTimer_.isActive()) {
        flushTimer_.start();
    }
    return lines_->count() - 1;
}

int UReportList::GetCount() const
{
    return lines_->count();
}

QString UReportList::GetText(int row) const
{
    return lines_->line(row);
}

int UReportList::GetCurSel() const
{
    return newest_ >= 0 ? newest_ : currentIndex().row();
}

void UReportList::CopyLine() const
{
    if (GetCurSel() >= 0) {
        const bool isCopied =
            kareport::doneWhileMemoryLasts([this] { QGuiApplication::clipboard()->setText(GetText(GetCurSel())); });
        if (!isCopied) {
            kareport::sayNotCopied();
        }
    }
}

void UReportList::flush()
{
    lines_->publish();
    if (newest_ >= 0) {
        setCurrentIndex(lines_->index(newest_));
        newest_ = -1;
    }
}

void UReportList::measureAgain()
{
    *lineWidth_ = kareport::LineWidth(font(), viewport());
    rowHeight_ = lineWidth_->lineHeight() + 1;
    extent_ = 0;
    for (int row = 0; row < lines_->count(); ++row) {
        extent_ = std::max(extent_, lineWidth_->of(lines_->line(row)));
    }
    scheduleDelayedItemsLayout();
}

void UReportList::Resize(int x, int y, int width, int height)
{
    if (!isCreated_) {
        return;
    }
    setGeometry(x, y, width, height);
    UpdateScrollBarInfo();
    viewport()->update();
}

QRect UReportList::ClipRect(const QRect &rect) const
{
    const QRect client = viewport()->rect();
    if (rect.x() >= rightOf(client) || rect.y() >= bottomOf(client) || rightOf(rect) < client.x() ||
        bottomOf(rect) < client.y())
    {
        return QRect();
    }
    const QPoint topLeft(std::max(rect.x(), client.x()), std::max(rect.y(), client.y()));
    return QRect(topLeft, QSize(std::min(rightOf(rect), rightOf(client)) - topLeft.x(),
                                std::min(bottomOf(rect), bottomOf(client)) - topLeft.y()));
}

void UReportList::OnHScroll(unsigned code, int position, QScrollBar * /*bar*/)
{
    scrollContent(*horizontalScrollBar(), code, position, QPoint(1, 0));
}

void UReportList::OnVScroll(unsigned code, int position, QScrollBar * /*bar*/)
{
    scrollContent(*verticalScrollBar(), code, position, QPoint(0, 1));
}

void UReportList::scrollContent(QScrollBar &bar, unsigned code, int position, QPoint direction)
{
    const int current = bar.value();
    const int next = positionAfter(code, current, position);
    const QRect moved = contentRect_.translated(direction * (current - next));
    if (next == current || ClipRect(moved).isEmpty()) {
        return;
    }
    contentRect_ = moved;
    viewport()->update();
    bar.setValue(next);
}

void UReportList::UpdateScrollBarInfo()
{
    const QRect client = viewport()->rect();
    horizontalScrollBar()->setPageStep(client.width());
    horizontalScrollBar()->setRange(std::min(client.x(), contentRect_.x()),
                                    std::max(rightOf(client), rightOf(contentRect_)));
    verticalScrollBar()->setPageStep(client.height());
    verticalScrollBar()->setRange(std::min(client.y(), contentRect_.y()),
                                  std::max(bottomOf(client), bottomOf(contentRect_)));
    scheduleDelayedItemsLayout();
}

bool UReportList::event(QEvent *event)
{
    // The list copies by itself: the main frame's command of the same key copies from the active view.
    if (event->type() == QEvent::ShortcutOverride && static_cast<QKeyEvent *>(event)->matches(QKeySequence::Copy)) {
        event->accept();
        return true;
    }
    return QListView::event(event);
}

void UReportList::changeEvent(QEvent *event)
{
    QListView::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        measureAgain();
    }
}

void UReportList::keyPressEvent(QKeyEvent *event)
{
    const int key = event->key();
    if ((key == Qt::Key_Left || key == Qt::Key_Right) && event->modifiers() == Qt::NoModifier) {
        horizontalScrollBar()->triggerAction(key == Qt::Key_Left ? QScrollBar::SliderSingleStepSub
                                                                 : QScrollBar::SliderSingleStepAdd);
        return;
    }
    QListView::keyPressEvent(event);
}
