#pragma once

class QWidget;

namespace kareport
{

/// Whether a window is the frame, or one in which panes of the frame float. A dialog is neither.
bool holdsPanes(const QWidget *window, const QWidget *frame);

/// Whether a widget is a window or belongs to it, as its menus and its floating panes do, and what is in them.
bool belongsTo(const QWidget *widget, const QWidget &window);

/// Remembers a window that holds panes as the one in which the keyboard was last.
void noteKeyboardWindow(const QWidget *window);

/// Whether no window of the program is active because the one that was noted has gone or is in the frame again. While the
/// user works with another program, that window is still there.
bool hasLostWindow();

} // namespace kareport
