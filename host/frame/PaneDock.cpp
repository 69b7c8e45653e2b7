#include "PaneDock.h"

#include "COneViewPane.h"
#include "UXTPMDIFrameWnd.h"
#include "Xlate.h"

#include <QAction>
#include <QCloseEvent>
#include <QMainWindow>
#include <QPointer>
#include <QStyleOptionDockWidget>
#include <QStylePainter>
#include <QTabBar>

#include <algorithm>

namespace kareport
{

namespace
{

QMainWindow *frameOf(const QWidget &dock)
{
    // Floating docks that were dropped on each other share a window of their own.
    for (QWidget *parent = dock.parentWidget(); parent != nullptr; parent = parent->parentWidget()) {
        if (auto *frame = qobject_cast<QMainWindow *>(parent)) {
            return frame;
        }
    }
    return nullptr;
}

} // namespace

PaneDock::PaneDock(COneViewPane *pane) : pane_(pane)
{
    setFocusPolicy(Qt::NoFocus);
    setObjectName(QStringLiteral("pane")); // a frame that saves its layout asks for one
    setAttribute(Qt::WA_DeleteOnClose, false);
    connect(this, &QDockWidget::topLevelChanged, this, &PaneDock::showCaption);
    // The frame is still in the middle of placing it.
    connect(this, &QDockWidget::dockLocationChanged, this, &PaneDock::standAlone, Qt::QueuedConnection);
    // A user who brings a pane back from the frame's list of panes wants to see it, even if it is one of several tabs.
    connect(toggleViewAction(), &QAction::triggered, this, [this](bool shown) {
        if (shown && pane_ != nullptr) {
            pane_->BringToTop();
        }
    });
}

void PaneDock::setCaption(const QString &caption)
{
    caption_ = caption;
    showCaption();
}

void PaneDock::setMarked(bool marked)
{
    if (marked_ != marked) {
        marked_ = marked;
        showCaption();
        update();
    }
}

void PaneDock::setUnsaved(bool unsaved)
{
    if (unsaved_ != unsaved) {
        unsaved_ = unsaved;
        showCaption();
    }
}

void PaneDock::showCaption()
{
    // On tabs and title bars an ampersand marks a key.
    const QString text = QString(caption_).replace(u'&', QStringLiteral("&&"));
    const QString star = unsaved_ ? QStringLiteral(" *") : QString();
    setWindowTitle(marked_ && isFloating() ? QStringLiteral("\u25CF ") + text + star : text + star);
    setAccessibleName(unsaved_ ? Xlate("%1, not saved").arg(caption_) : caption_);
}

bool PaneDock::isTabbedAgainstItsWill() const
{
    if (pane_ == nullptr || pane_->CanBeTabbedDocument()) {
        return false;
    }
    QMainWindow *frame = frameOf(*this);
    // A frame that makes tabs of all that it docks would only do it again.
    if (frame == nullptr || frame->dockOptions().testFlag(QMainWindow::ForceTabbedDocks)) {
        return false;
    }
    if (parentWidget() != frame) {
        return true;
    }
    const auto tabs = isFloating() ? QList<QDockWidget *>() : frame->tabifiedDockWidgets(const_cast<PaneDock *>(this));
    // A floating dock widget keeps a place in the row that it came from. Panes that must not be among the documents may be
    // tabs of a row of their own.
    return std::any_of(tabs.begin(), tabs.end(), [](const QDockWidget *tab) {
        const auto *other = dynamic_cast<const PaneDock *>(tab);
        const bool isOther = other == nullptr || (other->pane() != nullptr && other->pane()->CanBeTabbedDocument());
        return isOther && !tab->isFloating();
    });
}

void PaneDock::standAlone()
{
    if (!isTabbedAgainstItsWill()) {
        return;
    }
    QMainWindow *frame = frameOf(*this);
    const Qt::DockWidgetArea area = frame->dockWidgetArea(this);
    const Qt::DockWidgetArea place = area == Qt::NoDockWidgetArea ? Qt::BottomDockWidgetArea : area;
    if (auto *ofPanes = dynamic_cast<UXTPMDIFrameWnd *>(frame)) {
        ofPanes->DockBar(*pane_, place);
    } else {
        frame->addDockWidget(place, this);
    }
}

bool PaneDock::isBehindTab() const
{
    // The frame moves what is behind a tab out of its area and leaves it visible.
    return !isWindow() && (geometry().right() < 0 || geometry().bottom() < 0);
}

void PaneDock::comeToFront()
{
    raise();
    if (isWindow() || parentWidget() == nullptr) {
        return;
    }
    // Raising changes the tab only where the frame is the parent, not in a window in which panes float as tabs, and only
    // where the dock widget is not above its siblings already, which those behind a tab can be as well.
    for (QTabBar *tabs : parentWidget()->findChildren<QTabBar *>(QString(), Qt::FindDirectChildrenOnly)) {
        for (int tab = 0; tab < tabs->count(); ++tab) {
            if (tabs->tabData(tab).value<quintptr>() == reinterpret_cast<quintptr>(this)) {
                tabs->setCurrentIndex(tab);
            }
        }
    }
    if (parentWidget() != frameOf(*this)) {
        parentWidget()->raise();
    }
}

void PaneDock::setVisible(bool visible)
{
    const bool wasHidden = isHidden();
    QDockWidget::setVisible(visible);
    if (pane_ != nullptr && isHidden() != wasHidden) {
        pane_->DockShown(!isHidden());
    }
}

void PaneDock::activatePane()
{
    UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get();
    if (frame != nullptr && pane_ != nullptr && pane_->IsInFront()) {
        frame->ActivatePane(*pane_);
    }
}

void PaneDock::noteFront()
{
    const bool isInFront = pane_ != nullptr && pane_->IsInFront();
    if (wasInFront_ == isInFront) {
        return;
    }
    wasInFront_ = isInFront;
    // A window in which panes float as tabs does not tell the frame when it places them again.
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get(); frame != nullptr && pane_ != nullptr) {
        frame->SettleLater();
    }
}

bool PaneDock::event(QEvent *event)
{
    const QPointer<PaneDock> self(this);
    const bool taken = QDockWidget::event(event);
    if (self && (event->type() == QEvent::Move || event->type() == QEvent::Show || event->type() == QEvent::Hide)) {
        noteFront();
    }
    // A press that nothing in the pane took, as on its title, and a window of its own that comes to the front.
    const bool isPressed =
        event->type() == QEvent::MouseButtonPress || event->type() == QEvent::NonClientAreaMouseButtonPress;
    if (self && (isPressed || (event->type() == QEvent::WindowActivate && isWindow()))) {
        activatePane();
    }
    return taken;
}

void PaneDock::closeEvent(QCloseEvent *event)
{
    if (pane_ == nullptr) {
        QDockWidget::closeEvent(event);
        return;
    }
    // The pane, when it closes, takes this widget away later: it must outlive the event.
    event->ignore();
    const QPointer<PaneDock> self(this);
    pane_->OnSysCommand(COneViewPane::scClose, 0);
    if (self && self->pane_ != nullptr) {
        toggleViewAction()->setChecked(true); // the pane has not closed
    }
}

void PaneDock::paintEvent(QPaintEvent *event)
{
    QDockWidget::paintEvent(event);
    QStyleOptionDockWidget option;
    initStyleOption(&option);
    // Where the window system draws the caption, the content takes its place.
    if (!marked_ || (widget() != nullptr && option.rect.intersects(widget()->geometry()))) {
        return;
    }
    // Not behind the buttons: styles draw them for the colour of the window.
    const QRect text = style()->subElementRect(QStyle::SE_DockWidgetTitleBarText, &option, this);
    QRect marked = option.rect;
    if (layoutDirection() == Qt::LeftToRight) {
        marked.setRight(text.right());
    } else {
        marked.setLeft(text.left());
    }
    QStylePainter painter(this);
    painter.fillRect(marked, palette().color(QPalette::Highlight));
    option.palette.setColor(QPalette::WindowText, palette().color(QPalette::HighlightedText));
    painter.drawControl(QStyle::CE_DockWidgetTitle, option);
}

} // namespace kareport
