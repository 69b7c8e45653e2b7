#include "UXTPMDIFrameWnd.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "RememberedView.h"
#include "UView.h"

#include <QApplication>
#include <QPointer>
#include <QTabBar>

#include <algorithm>

namespace
{

/// Whether a window is the frame, or one in which panes of it float. A dialog is none.
bool holdsPanes(const QWidget *window, const QWidget *frame)
{
    return window == frame || dynamic_cast<const kareport::PaneDock *>(window) != nullptr ||
           (window != nullptr && window->inherits("QDockWidgetGroupWindow"));
}

/// The window in which the keyboard was last, of those that hold panes.
QPointer<const QWidget> &keyboardWindow()
{
    static QPointer<const QWidget> window;
    return window;
}

/// Whether no window of the program is the active one because that which was has gone, or stands in the frame again. While
/// the user works with another program it is there still.
bool hasLostWindow()
{
    static bool hadWindow = false;
    hadWindow = hadWindow || !keyboardWindow().isNull();
    const QWidget *window = keyboardWindow();
    return hadWindow && QApplication::activeWindow() == nullptr &&
           (window == nullptr || !window->isWindow() || !window->isVisible());
}

bool hasKeyboard(UView &view)
{
    const QWidget *widget = view.GetWidget();
    const QWidget *focus = widget != nullptr ? widget->window()->focusWidget() : nullptr;
    return focus != nullptr && (focus == widget || widget->isAncestorOf(focus));
}

/// Makes a view the active one and tells the one before. @return the one before, unless it has gone since
kareport::RememberedView replaceActive(UView *&active, UView *view)
{
    const kareport::RememberedView before(active);
    active = view;
    if (before.get() != nullptr && before.get() != view) {
        before.get()->OnActivateView(false, view, before.get());
    }
    return before;
}

/// Makes a view the active one, and tells it and the one before: each once. Whatever is told may close either.
void activate(UView *&active, UView *view)
{
    const kareport::RememberedView before = replaceActive(active, view);
    if (view == nullptr || active != view) {
        return;
    }
    if (before.get() != view || !hasKeyboard(*view)) {
        view->OnActivateView(true, view, before.get());
    }
}

} // namespace

COneViewPane *UXTPMDIFrameWnd::PaneOf(const QWidget *widget) const
{
    // A dialog that a view has opened is not in the view's pane.
    const kareport::PaneDock *dock = nullptr;
    for (; widget != nullptr && widget != this; widget = widget->parentWidget()) {
        dock = dock == nullptr ? dynamic_cast<const kareport::PaneDock *>(widget) : dock;
        if (widget->isWindow() && !holdsPanes(widget, this)) {
            return nullptr;
        }
    }
    return widget == this && dock != nullptr ? dock->pane() : nullptr;
}

COneViewPane *UXTPMDIFrameWnd::PaneInFront(const QWidget *window) const
{
    const auto isInFront = [window](const COneViewPane *pane) {
        return pane->IsInFront() && (window == nullptr || pane->GetDock()->window() == window);
    };
    const auto used = std::find_if(usedPanes_.rbegin(), usedPanes_.rend(), isInFront);
    if (used != usedPanes_.rend()) {
        return *used;
    }
    COneViewPane *inFront = nullptr;
    for (const QDockWidget *dock : findChildren<QDockWidget *>()) {
        COneViewPane *pane = PaneOf(dock);
        if (pane != nullptr && isInFront(pane) && (inFront == nullptr || pane->GetActiveView() != nullptr)) {
            inFront = pane;
        }
    }
    return inFront;
}

void UXTPMDIFrameWnd::TakePane(COneViewPane &pane)
{
    std::erase(usedPanes_, &pane);
    usedPanes_.push_back(&pane);
    activePane_ = &pane;
    if (UView *view = pane.GetActiveView()) {
        activate(activeView_, view);
    }
    UpdateCommands();
}

void UXTPMDIFrameWnd::ActivatePane(COneViewPane &pane)
{
    QDockWidget *dock = pane.GetDock();
    if (dock == nullptr || PaneOf(dock) != &pane) {
        return;
    }
    QWidget *window = dock->window();
    const QWidget *active = QApplication::activeWindow();
    if (hasLostWindow() || (active != nullptr && active != window && holdsPanes(active, this))) {
        window->activateWindow();
    }
    const QWidget *focus = window->focusWidget();
    if (pane.GetActiveView() == nullptr && (focus == nullptr || !dock->isAncestorOf(focus)) &&
        dock->widget() != nullptr) {
        dock->widget()->setFocus(Qt::OtherFocusReason);
    }
    TakePane(pane);
}

void UXTPMDIFrameWnd::SetActiveViewForFrameAndPane(UView *view)
{
    auto *pane = view != nullptr ? dynamic_cast<COneViewPane *>(view->GetParentPane()) : nullptr;
    if (pane != nullptr && pane->IsVisible() && PaneOf(pane->GetDock()) == pane) {
        if (!pane->IsInFront()) {
            pane->BringToTop();
        } else {
            ActivatePane(*pane);
        }
        return;
    }
    if (activePane_ != nullptr && activePane_->GetActiveView() != nullptr) {
        activePane_ = nullptr;
    }
    if (view == nullptr || view->GetParentPane() == nullptr || view->GetParentPane()->IsVisible()) {
        activate(activeView_, view);
    } else {
        // Nobody sees it: it cannot take the keyboard, and is told when its pane is shown. The pane where the keyboard
        // is gets its commands back.
        replaceActive(activeView_, view);
        SettleLater();
    }
    UpdateCommands();
}

void UXTPMDIFrameWnd::ResetActiveViewForFrameAndPane(UView *view)
{
    if (activeView_ == view) {
        activeView_ = nullptr;
        SettleLater();
    }
}

void UXTPMDIFrameWnd::LeavePane(const COneViewPane &pane)
{
    if (activePane_ == &pane) {
        activePane_ = nullptr;
    }
    if (activeView_ != nullptr && activeView_->GetParentPane() == &pane) {
        activeView_ = nullptr;
        UpdateCommands();
    }
    SettleLater();
}

void UXTPMDIFrameWnd::ForgetPane(const COneViewPane &pane)
{
    LeavePane(pane);
    std::erase(usedPanes_, &pane);
}

void UXTPMDIFrameWnd::SettleLater()
{
    if (!willSettle_) {
        willSettle_ = true;
        QMetaObject::invokeMethod(
            this,
            [this] {
                willSettle_ = false;
                SettlePanes();
            },
            Qt::QueuedConnection);
    }
}

void UXTPMDIFrameWnd::SettlePanes()
{
    WatchTabs();
    auto *pane = activeView_ != nullptr ? dynamic_cast<COneViewPane *>(activeView_->GetParentPane()) : nullptr;
    if (activeView_ != nullptr && pane == nullptr) {
        return; // it stands in a window of the host's own
    }
    if (pane != nullptr && !pane->IsInFront()) {
        activeView_ = nullptr;
    }
    if (activePane_ != nullptr && !activePane_->IsInFront()) {
        activePane_ = nullptr;
    }
    const QWidget *focus = QApplication::focusWidget();
    if (COneViewPane *withKeyboard = PaneOf(focus); withKeyboard != nullptr && withKeyboard->IsInFront()) {
        if (withKeyboard != activePane_) {
            TakePane(*withKeyboard);
        }
        return;
    }
    if (focus != nullptr && focus == tabsOfNewWindow_) {
        tabsOfNewWindow_ = nullptr;
        if (COneViewPane *shown = PaneInFront(focus->window())) {
            ActivatePane(*shown);
            return;
        }
    }
    // The keyboard is in a pane or a row of tabs that nobody sees, or was in one that has gone; a menu or a bar may have it.
    const bool isInTabs = qobject_cast<const QTabBar *>(focus) != nullptr && focus->focusPolicy() == Qt::NoFocus;
    const bool isLost = focus == nullptr ? hasLostWindow() || holdsPanes(QApplication::activeWindow(), this)
                                         : PaneOf(focus) != nullptr || isInTabs;
    COneViewPane *next = activePane_ != nullptr ? activePane_ : PaneInFront();
    if (next != nullptr && (isLost || activePane_ == nullptr)) {
        ActivatePane(*next);
    } else {
        UpdateCommands();
    }
}

void UXTPMDIFrameWnd::FollowKeyboard(const QWidget *before, const QWidget *now)
{
    if (now != nullptr && holdsPanes(now->window(), this)) {
        keyboardWindow() = now->window();
    }
    // A window that becomes the active one gives the keyboard to its first widget, which may be a row of tabs. One that
    // the user has gone to with the Tab key keeps it.
    const bool isNewWindow = now != nullptr && (before == nullptr || before->window() != now->window());
    if (isNewWindow && qobject_cast<const QTabBar *>(now) != nullptr && holdsPanes(now->window(), this)) {
        tabsOfNewWindow_ = now;
        SettleLater();
    }
    COneViewPane *pane = PaneOf(now);
    if (pane == nullptr || pane == activePane_) {
        return;
    }
    if (pane->IsInFront()) {
        TakePane(*pane);
    } else {
        SettleLater();
    }
}

void UXTPMDIFrameWnd::WatchTabs()
{
    for (QTabBar *tabs : findChildren<QTabBar *>()) {
        if (holdsPanes(tabs->parentWidget(), this)) {
            connect(tabs, &QTabBar::tabBarClicked, this, &UXTPMDIFrameWnd::TabClicked, Qt::UniqueConnection);
            // Qt keeps rows without tabs out of sight, where the Tab key would lead to them.
            tabs->setFocusPolicy(tabs->count() > 1 ? Qt::TabFocus : Qt::NoFocus);
        }
    }
}

void UXTPMDIFrameWnd::TabClicked(int index)
{
    // A tab that is in front already does not change: the pane gets the keyboard all the same.
    const auto *tabs = qobject_cast<const QTabBar *>(sender());
    const auto clicked = tabs != nullptr ? tabs->tabData(index).value<quintptr>() : 0;
    for (const QDockWidget *dock : findChildren<QDockWidget *>()) {
        COneViewPane *pane = reinterpret_cast<quintptr>(dock) == clicked ? PaneOf(dock) : nullptr;
        if (pane != nullptr && pane->IsInFront()) {
            ActivatePane(*pane);
            return;
        }
    }
}

UDocument *UXTPMDIFrameWnd::GetCommandDocument() const
{
    if (activePane_ != nullptr && activePane_->GetShownDocument() != nullptr) {
        return activePane_->GetShownDocument();
    }
    return activeView_ != nullptr ? activeView_->GetDocument() : nullptr;
}

kareport::CommandTarget *UXTPMDIFrameWnd::PaneTarget() const
{
    return activePane_ != nullptr && activePane_->IsInFront() ? activePane_->GetCommandTarget() : nullptr;
}

kareport::CommandTarget *UXTPMDIFrameWnd::ViewTarget() const
{
    const CViewPane *pane = activeView_ != nullptr ? activeView_->GetParentPane() : nullptr;
    return pane == nullptr || pane->IsInFront() ? dynamic_cast<kareport::CommandTarget *>(activeView_) : nullptr;
}
