#pragma once

#include <QString>

class UXTPMDIFrameWnd;

namespace kareport
{

/// What the reasons of commands are about: what is in front, and what else there is.
struct DeskState
{
    bool hasReport = false;      ///< one is in front
    bool isReportWindow = false; ///< it is in the window that shows lines while they are written
    bool isWritten = true;       ///< all of it is; false while a job still writes it
    bool isHeldByEditor = false; ///< it can only be closed when the user's editor is
    bool isLoading = false;      ///< its view does not have all of it yet
    bool hasSelection = false;   ///< in its view
    bool needsSave = false;      ///< it has changes, or no file
    bool isMadeByJob = false;    ///< so that its values are known
    int shownReports = 0;
    int shownWindows = 0; ///< panes of reports
    bool hasRecentFiles = false;
};

/// What the state of a frame's commands depends on.
DeskState deskState(const UXTPMDIFrameWnd &frame);

/// Whether a command that its handler enables has something to act on.
bool canAct(unsigned command, const DeskState &state);
/// Why a command is disabled, as a sentence; empty where nothing is known.
QString whyDisabled(unsigned command, const DeskState &state);

} // namespace kareport
