#include "TabClosing.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "PaneWindows.h"

#include <QApplication>
#include <QMouseEvent>
#include <QPointer>
#include <QTabBar>

namespace kareport
{

TabClosing::TabClosing(QWidget &frame) : QObject(&frame), frame_(frame)
{
    // Rows of tabs come and go, and move from window to window.
    qApp->installEventFilter(this);
}

bool TabClosing::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::MouseButtonPress && event->type() != QEvent::MouseButtonRelease) {
        return false;
    }
    const auto *tabs = qobject_cast<const QTabBar *>(watched);
    const auto *mouse = static_cast<const QMouseEvent *>(event);
    if (tabs == nullptr || mouse->button() != Qt::MiddleButton || !holdsPanes(tabs->parentWidget(), &frame_)) {
        return false;
    }
    const int tab = tabs->tabAt(mouse->position().toPoint());
    if (event->type() == QEvent::MouseButtonPress) {
        pressed_ = watched;
        tab_ = tab;
    } else if (pressed_ == watched && tab_ == tab && tab >= 0) {
        pressed_ = nullptr;
        closeTab(*tabs, tab);
    }
    return true;
}

void TabClosing::closeTab(const QTabBar &tabs, int tab) const
{
    const auto id = tabs.tabData(tab).value<quintptr>();
    for (QDockWidget *dock : frame_.findChildren<QDockWidget *>()) {
        auto *paneDock = reinterpret_cast<quintptr>(dock) == id ? dynamic_cast<PaneDock *>(dock) : nullptr;
        if (paneDock != nullptr && paneDock->pane() != nullptr) {
            // Not from within the click: the row of tabs may go with the report.
            QMetaObject::invokeMethod(
                paneDock,
                [paneDock] {
                    if (paneDock->pane() != nullptr) {
                        paneDock->pane()->OnSysCommand(COneViewPane::scClose, 0);
                    }
                },
                Qt::QueuedConnection);
            return;
        }
    }
}

} // namespace kareport
