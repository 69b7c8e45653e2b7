#include "PaneWindows.h"

#include "PaneDock.h"

#include <QApplication>
#include <QPointer>

namespace kareport
{

namespace
{

/// The window in which the keyboard was last, of those that hold panes.
QPointer<const QWidget> &keyboardWindow()
{
    static QPointer<const QWidget> window;
    return window;
}

} // namespace

bool holdsPanes(const QWidget *window, const QWidget *frame)
{
    return window == frame || dynamic_cast<const PaneDock *>(window) != nullptr ||
           (window != nullptr && window->inherits("QDockWidgetGroupWindow"));
}

bool belongsTo(const QWidget *widget, const QWidget &window)
{
    while (widget != nullptr && widget != &window) {
        widget = widget->parentWidget();
    }
    return widget != nullptr;
}

void noteKeyboardWindow(const QWidget *window)
{
    keyboardWindow() = window;
}

bool hasLostWindow()
{
    static bool hadWindow = false;
    hadWindow = hadWindow || !keyboardWindow().isNull();
    const QWidget *window = keyboardWindow();
    return hadWindow && QApplication::activeWindow() == nullptr &&
           (window == nullptr || !window->isWindow() || !window->isVisible());
}

} // namespace kareport
