#pragma once

#include "KaReportExport.h"

class QMenu;
class QMenuBar;
class UXTPMDIFrameWnd;

namespace kareport
{

/// The menus of a report in a menu bar, which owns them.
struct ReportMenu
{
    QMenu *file = nullptr;   ///< New to Exit
    QMenu *edit = nullptr;   ///< Undo to Paste
    QMenu *view = nullptr;   ///< Toolbar and Status Bar
    QMenu *window = nullptr; ///< New Window to Arrange Icons
    QMenu *help = nullptr;   ///< Help and About
};

/// Adds the menus of a report to a menu bar: File, Edit, View, Window and Help, in the user's language. Their commands go
/// through the frame to whatever shows the report; those that only a host can do, such as New and Open, are disabled unless
/// the frame's own commands handle their numbers. The host may add entries of its own; the action of an entry is
/// `frame.CommandAction(number)`.
KAREPORT_EXPORT ReportMenu addReportMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar);

} // namespace kareport
