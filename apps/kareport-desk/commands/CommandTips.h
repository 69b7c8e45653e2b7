#pragma once

#include <QObject>

#include <functional>

class QMainWindow;

namespace kareport
{

/// Says in the status bar why a command is disabled while the mouse is on its entry in a menu, which Qt does for commands that
/// are enabled only; and has the states of all commands looked at before a key is looked up among them.
class CommandTips : public QObject
{
public:
    /// @param frame   owns this object
    /// @param update  brings the states of the commands up to date
    CommandTips(QMainWindow &frame, std::function<void()> update);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QMainWindow &frame_;
    std::function<void()> update_;
};

} // namespace kareport
