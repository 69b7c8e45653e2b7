#include "UXTPMDIFrameWnd.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "PlainTabTips.h"
#include "UView.h"

#include <QAction>
#include <QApplication>
#include <QDockWidget>
#include <QEvent>
#include <QMenu>
#include <QTimer>

#include <utility>

namespace
{

UXTPMDIFrameWnd *&theFrame()
{
    static UXTPMDIFrameWnd *frame = nullptr;
    return frame;
}

/// How often the actions follow the state of what they act on.
constexpr int updateInterval = 200; // milliseconds

} // namespace

UXTPMDIFrameWnd::UXTPMDIFrameWnd(QWidget *parent) : QMainWindow(parent)
{
    theFrame() = this;
    // Neither animated nor dragged as rows of tabs: when a dock widget is destroyed while another one moves into its
    // place, or is dropped on a window of tabs, Qt 6.4 lays out what no longer exists.
    setDockOptions(QMainWindow::AllowNestedDocks | QMainWindow::AllowTabbedDocks);
    setTabPosition(Qt::AllDockWidgetAreas, QTabWidget::North);
    new kareport::PlainTabTips(*this);
    auto *updateTimer = new QTimer(this);
    connect(updateTimer, &QTimer::timeout, this, &UXTPMDIFrameWnd::UpdateCommands);
    updateTimer->start(updateInterval);
    connect(qApp, &QApplication::focusChanged, this, &UXTPMDIFrameWnd::FollowKeyboard);
    connect(this, &QMainWindow::tabifiedDockWidgetActivated, this, [this](const QDockWidget *dock) {
        if (COneViewPane *pane = PaneOf(dock); pane != nullptr && pane->IsInFront()) {
            ActivatePane(*pane);
        }
    });
}

UXTPMDIFrameWnd::~UXTPMDIFrameWnd()
{
    // Its content is destroyed after this: the keyboard that it loses goes to nothing.
    QObject::disconnect(qApp, nullptr, this, nullptr);
    QObject::disconnect(this, &QMainWindow::tabifiedDockWidgetActivated, this, nullptr);
    if (theFrame() == this) {
        theFrame() = nullptr;
    }
}

UXTPMDIFrameWnd *UXTPMDIFrameWnd::Get()
{
    return theFrame();
}

QAction *UXTPMDIFrameWnd::CommandAction(unsigned id)
{
    QAction *&action = actions_[id];
    if (action == nullptr) {
        action = new QAction(this);
        action->setData(id);
        connect(action, &QAction::triggered, this, [this, id] { OnCommand(id); });
    }
    return action;
}

QAction *UXTPMDIFrameWnd::AddCommand(QMenu &menu, unsigned id, const QString &text)
{
    QAction *action = CommandAction(id);
    action->setText(text.section(u'\t', 0, 0));
    if (const QString key = text.section(u'\t', 1, 1); !key.isEmpty()) {
        action->setShortcut(QKeySequence(key));
    }
    menu.addAction(action);
    connect(&menu, &QMenu::aboutToShow, this, &UXTPMDIFrameWnd::UpdateCommands, Qt::UniqueConnection);
    return action;
}

bool UXTPMDIFrameWnd::OnCommand(unsigned id)
{
    kareport::CommandState state;
    if (kareport::CommandTarget *shown = PaneTarget(); shown != nullptr && shown->updateCommand(id, state)) {
        return state.enabled && shown->runCommand(id);
    }
    kareport::CommandTarget *target = ViewTarget();
    return (target != nullptr && target->runCommand(id)) || runCommand(id);
}

void UXTPMDIFrameWnd::UpdateCommands()
{
    const kareport::CommandTarget *shown = PaneTarget();
    const kareport::CommandTarget *target = ViewTarget();
    for (auto action = actions_.cbegin(); action != actions_.cend(); ++action) {
        kareport::CommandState state;
        state.checked = action.value()->isChecked();
        const bool known = (shown != nullptr && shown->updateCommand(action.key(), state)) ||
                           (target != nullptr && target->updateCommand(action.key(), state)) ||
                           updateCommand(action.key(), state);
        action.value()->setEnabled(known && state.enabled && CanAct(action.key()));
        if (action.value()->isCheckable()) {
            action.value()->setChecked(state.checked);
        }
    }
}

bool UXTPMDIFrameWnd::CanAct(unsigned /*command*/) const
{
    return true;
}

bool UXTPMDIFrameWnd::event(QEvent *event)
{
    const bool taken = QMainWindow::event(event);
    if (event->type() == QEvent::LayoutRequest) {
        SettleLater();
        // Another dock widget may have become a tab with one that must have no tabs: only that one knows then.
        for (QDockWidget *dock : findChildren<QDockWidget *>()) {
            auto *paneDock = dynamic_cast<kareport::PaneDock *>(dock);
            if (paneDock != nullptr && paneDock->isTabbedAgainstItsWill()) {
                QMetaObject::invokeMethod(paneDock, &kareport::PaneDock::standAlone, Qt::QueuedConnection);
            }
        }
    }
    return taken;
}

void UXTPMDIFrameWnd::DockPane(COneViewPane &pane)
{
    QDockWidget *first = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(dock);
        if (paneDock != nullptr && paneDock->pane() != nullptr && !paneDock->pane()->CanBeTabbedDocument()) {
            continue;
        }
        if (dock != pane.GetDock() && dockWidgetArea(dock) == Qt::TopDockWidgetArea && !dock->isFloating()) {
            first = dock;
        }
    }
    addDockWidget(Qt::TopDockWidgetArea, pane.GetDock());
    if (first != nullptr) {
        tabifyDockWidget(first, pane.GetDock());
    }
}

void UXTPMDIFrameWnd::DockBar(COneViewPane &pane, Qt::DockWidgetArea area)
{
    addDockWidget(area, pane.GetDock());
}

const std::vector<kareport::Command> &UXTPMDIFrameWnd::commands() const
{
    static const std::vector<kareport::Command> none;
    return none;
}
