#include "CommandButton.h"

#include <QAction>
#include <QToolBar>

namespace kareport
{

void addCommandButton(QToolBar &bar, QAction &command)
{
    bar.addAction(&command);
    QString name = command.text();
    name.remove(u'&');
    while (name.endsWith(u'.')) {
        name.chop(1);
    }
    const QString key = command.shortcut().toString(QKeySequence::NativeText);
    command.setToolTip(key.isEmpty() ? name : name + QStringLiteral(" (") + key + u')');
    bar.widgetForAction(&command)->setAccessibleName(name);
}

} // namespace kareport
