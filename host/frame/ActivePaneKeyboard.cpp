// How the active pane follows the keyboard, and the keyboard the active pane.
#include "COneViewPane.h"
#include "PaneWindows.h"
#include "UView.h"
#include "UXTPMDIFrameWnd.h"

#include <QApplication>
#include <QDockWidget>
#include <QTabBar>

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
        return; // it is in a window of the host's own
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
    // The keyboard is in a pane or a row of tabs that is hidden, or was in one that was closed; a menu or a bar may
    // have it.
    const bool isInTabs = qobject_cast<const QTabBar *>(focus) != nullptr && focus->focusPolicy() == Qt::NoFocus;
    const bool isLost = focus == nullptr
                            ? kareport::hasLostWindow() || kareport::holdsPanes(QApplication::activeWindow(), this)
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
    if (now != nullptr && kareport::holdsPanes(now->window(), this)) {
        kareport::noteKeyboardWindow(now->window());
    }
    // A window that becomes the active one gives the keyboard to its first widget, which may be a row of tabs. One that
    // the user has gone to with the Tab key keeps it.
    const bool isNewWindow = now != nullptr && (before == nullptr || before->window() != now->window());
    if (isNewWindow && qobject_cast<const QTabBar *>(now) != nullptr && kareport::holdsPanes(now->window(), this)) {
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
        if (kareport::holdsPanes(tabs->parentWidget(), this)) {
            connect(tabs, &QTabBar::tabBarClicked, this, &UXTPMDIFrameWnd::TabClicked, Qt::UniqueConnection);
            // Qt keeps rows without tabs out of sight, where the Tab key would lead to them.
            tabs->setFocusPolicy(tabs->count() > 1 ? Qt::TabFocus : Qt::NoFocus);
        }
    }
}

void UXTPMDIFrameWnd::TabClicked(int index)
{
    // A tab that is in front already does not change: the pane still gets the keyboard.
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
