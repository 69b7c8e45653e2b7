#include "PlainTabTips.h"

#include "PlainWidgets.h"

#include <QChildEvent>
#include <QHelpEvent>
#include <QMainWindow>
#include <QTabBar>
#include <QToolTip>

namespace kareport
{

PlainTabTips::PlainTabTips(QMainWindow &frame) : QObject(&frame)
{
    frame.installEventFilter(this);
}

bool PlainTabTips::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::ChildPolished) {
        // The tab bar may move into a floating window later; it stays watched.
        if (auto *bar = qobject_cast<QTabBar *>(static_cast<QChildEvent *>(event)->child())) {
            bar->installEventFilter(this);
        }
    } else if (event->type() == QEvent::ToolTip) {
        if (auto *bar = qobject_cast<QTabBar *>(watched)) {
            const auto *help = static_cast<QHelpEvent *>(event);
            // The text of a tab marks keys by ampersands, and doubles those that mark none.
            QString text = bar->tabText(bar->tabAt(help->pos()));
            QToolTip::showText(help->globalPos(), plainToolTip(text.replace(QStringLiteral("&&"), QStringLiteral("&"))),
                               bar);
            return true;
        }
    }
    return QObject::eventFilter(watched, event);
}

} // namespace kareport
