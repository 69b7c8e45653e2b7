#include "CommandTips.h"

#include "PaneWindows.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMainWindow>
#include <QMenu>
#include <QMouseEvent>
#include <QStatusBar>

#include <utility>

namespace kareport
{

CommandTips::CommandTips(QMainWindow &frame, std::function<void()> update)
    : QObject(&frame), frame_(frame), update_(std::move(update))
{
    qApp->installEventFilter(this);
}

bool CommandTips::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::MouseMove) {
        const auto *menu = qobject_cast<const QMenu *>(watched);
        const QAction *action =
            belongsTo(menu, frame_) ? menu->actionAt(static_cast<QMouseEvent *>(event)->position().toPoint()) : nullptr;
        if (action != nullptr && !action->isEnabled() && !action->statusTip().isEmpty()) {
            frame_.statusBar()->showMessage(action->statusTip());
        }
    } else if (event->type() == QEvent::ShortcutOverride) {
        // A command that has become possible a moment ago is not to miss its key.
        const auto *key = static_cast<const QKeyEvent *>(event);
        const auto *widget = qobject_cast<const QWidget *>(watched);
        const bool isCommand = key->modifiers().testAnyFlags(Qt::ControlModifier | Qt::AltModifier) ||
                               (key->key() >= Qt::Key_F1 && key->key() <= Qt::Key_F35);
        if (isCommand && belongsTo(widget, frame_) && holdsPanes(widget->window(), &frame_)) {
            update_();
        }
    }
    return false;
}

} // namespace kareport
