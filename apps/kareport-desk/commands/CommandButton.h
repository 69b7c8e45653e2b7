#pragma once

class QAction;
class QToolBar;

namespace kareport
{

/// Adds a button for a command at the end of a bar. Its name, with the key of the command, is its tool tip.
void addCommandButton(QToolBar &bar, QAction &command);

} // namespace kareport
