#pragma once

class QWidget;

namespace kareport
{

/// Shows the program's messages and questions for file names as dialogs of a window.
void installDialogs(QWidget *parent);

} // namespace kareport
