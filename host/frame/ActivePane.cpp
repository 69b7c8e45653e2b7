#include "UXTPMDIFrameWnd.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "PaneWindows.h"
#include "RememberedView.h"
#include "UView.h"

#include <QApplication>

#include <algorithm>

namespace
{

bool hasKeyboard(UView &view)
{
    const QWidget *widget = view.GetWidget();
    const QWidget *focus = widget != nullptr ? widget->window()->focusWidget() : nullptr;
    return focus != nullptr && (focus == widget || widget->isAncestorOf(focus));
}

/// Makes a view the active one and tells the one before. @return the one before, unless it has been destroyed since
kareport::RememberedView replaceActive(UView *&active, UView *view)
{
    kareport::RememberedView before(active);
    active = view;
    if (UView *left = before.get(); left != nullptr && left != view) {
        left->OnActivateView(false, view, left);
    }
    return before;
}

/// Makes a view the active one, and tells it and the one before: each once. Either call may close either view.
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
    // A dialog that a view has opened does not belong to the view's pane.
    const kareport::PaneDock *dock = nullptr;
    for (; widget != nullptr && widget != this; widget = widget->parentWidget()) {
        dock = dock == nullptr ? dynamic_cast<const kareport::PaneDock *>(widget) : dock;
        if (widget->isWindow() && !kareport::holdsPanes(widget, this)) {
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
    if (!pane.IsInFront()) {
        SettleLater(); // the layout has not brought it to the front: it is the active one only if that comes
    }
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
    if (kareport::hasLostWindow() || (active != nullptr && active != window && kareport::holdsPanes(active, this))) {
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
        // It is not visible: it cannot take the keyboard, and is notified when its pane is shown. The pane where the
        // keyboard is gets its commands back.
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
