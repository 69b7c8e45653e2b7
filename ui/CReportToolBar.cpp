#include "CReportToolBar.h"

#include "ReportResources.h"
#include "Xlate.h"

#include <QAction>
#include <QContextMenuEvent>
#include <QToolButton>

CReportToolBar::CReportToolBar(kareport::CommandTarget *owner, QWidget *parent) : QToolBar(parent), owner_(owner)
{
    setMovable(false);
    setFloatable(false);
    setToolButtonStyle(Qt::ToolButtonIconOnly);
    setWindowTitle(Xlate("Report"));
    const kareport::ToolBarResource bar = kareport::reportBar(kareport::reportToolBar);
    setIconSize(bar.buttonSize);
    for (const unsigned id : bar.commands) {
        addButton(id);
    }
    CReportToolBar::showTips();
}

int CReportToolBar::GetDlgCtrlID() const
{
    return static_cast<int>(kareport::reportToolBar);
}

void CReportToolBar::addButton(unsigned id)
{
    QAction *button = addAction(kareport::reportIcon(id), QString());
    button->setData(id);
    connect(button, &QAction::triggered, this, [this, id] {
        if (kareport::CommandTarget *asked = target()) {
            asked->runCommand(id);
        }
    });
    // Without a mouse, the buttons are reached with the Tab key.
    widgetForAction(button)->setFocusPolicy(Qt::TabFocus);
}

void CReportToolBar::showTips()
{
    for (QAction *button : actions()) {
        QString tip;
        if (OnUserToolTip(button, tip)) {
            button->setText(tip);
            button->setToolTip(tip);
            button->setStatusTip(tip);
            widgetForAction(button)->setAccessibleName(tip);
        }
    }
}

bool CReportToolBar::OnShowControlBarMenu(const QPoint & /*point*/) const
{
    return false;
}

void CReportToolBar::OnUpdateCmdUI(UXTPMDIFrameWnd * /*frame*/, bool disableIfNoHandler)
{
    const kareport::CommandTarget *asked = target();
    for (QAction *button : actions()) {
        kareport::CommandState state;
        const bool known = asked != nullptr && asked->updateCommand(button->data().toUInt(), state);
        if (known || disableIfNoHandler) {
            button->setEnabled(known && state.enabled);
        }
    }
}

kareport::CommandTarget *CReportToolBar::target() const
{
    return owner_ != nullptr ? owner_ : dynamic_cast<kareport::CommandTarget *>(parentWidget());
}

bool CReportToolBar::OnUserToolTip(const QAction *button, QString &text) const
{
    text = Xlate(kareport::reportString(button->data().toUInt()));
    return true;
}

void CReportToolBar::contextMenuEvent(QContextMenuEvent *event)
{
    // Left unanswered, the event would go to the main frame, which shows a menu of all bars.
    event->setAccepted(!OnShowControlBarMenu(event->pos()));
}

void CReportToolBar::changeEvent(QEvent *event)
{
    QToolBar::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setWindowTitle(Xlate("Report"));
        showTips();
    }
}

void CReportToolBar::showEvent(QShowEvent *event)
{
    showTips(); // by classes that override them, too
    OnUpdateCmdUI(nullptr, true);
    QToolBar::showEvent(event);
}
