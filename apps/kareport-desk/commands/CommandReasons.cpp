#include "CommandReasons.h"

#include "COneViewPane.h"
#include "DeskCommandIds.h"
#include "PaneDock.h"
#include "ReportEdit.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UXTPMDIFrameWnd.h"
#include "Xlate.h"

#include <QTextCursor>

#include <algorithm>
#include <initializer_list>

namespace kareport
{

namespace
{

bool isOneOf(unsigned command, std::initializer_list<unsigned> commands)
{
    return std::find(commands.begin(), commands.end(), command) != commands.end();
}

/// Commands that are always in the menus, with or without a report.
bool needsNoReport(unsigned command)
{
    return isOneOf(command,
                   {fileNewCommand, fileOpenCommand, fileFromTemplateCommand, recentFileCommand, preferencesCommand,
                    exitCommand, viewToolBarCommand, viewStatusBarCommand, helpAboutCommand, helpContentsCommand,
                    commandListCommand, keepReportWindowCommand, viewThumbnailsCommand, viewPageLinesCommand});
}

} // namespace

DeskState deskState(const UXTPMDIFrameWnd &frame)
{
    DeskState state;
    const UApplication *application = UApplication::Get();
    if (application == nullptr) {
        return state;
    }
    state.hasRecentFiles = !application->GetRecentFileList().isEmpty();
    for (const UDocument *document : application->GetDocuments()) {
        int windows = 0;
        for (const UView *view : document->GetViews()) {
            windows += view->IsVisible() ? 1 : 0;
        }
        state.shownWindows += windows;
        state.shownReports += document->IsShown() ? 1 : 0;
    }
    const auto *report = dynamic_cast<const UReportDoc *>(frame.GetCommandDocument());
    if (report == nullptr) {
        return state;
    }
    state.hasReport = true;
    state.needsSave = report->IsModified() || report->GetPathName().isEmpty();
    state.isHeldByEditor = !report->EnableCloseOption();
    const auto *window = dynamic_cast<const UReportWindowDlg *>(report->GetReportWindow());
    COneViewPane *pane = frame.GetActivePane();
    state.isReportWindow = window != nullptr && pane != nullptr && pane == static_cast<const COneViewPane *>(window);
    state.isWritten = !state.isReportWindow || window->IsActive();
    auto *view = dynamic_cast<UReportView *>(frame.GetActiveView());
    // The window of a view may be destroyed before it, with the frame.
    if (!state.isReportWindow && view != nullptr && view->GetWidget() != nullptr) {
        state.isLoading = view->GetEdit().isLoading();
        state.hasSelection = view->GetEdit().textCursor().hasSelection();
    }
    return state;
}

bool canAct(unsigned command, const DeskState &state)
{
    switch (command) {
    case fileSaveCommand: return state.needsSave;
    case copyCommand: return state.isReportWindow || state.hasSelection;
    case cutCommand: return state.hasSelection && !state.isLoading;
    case pasteCommand: return !state.isLoading;
    case nextReportCommand:
    case previousReportCommand: return state.shownReports > 1;
    case windowCascadeCommand:
    case windowArrangeCommand:
    case windowTileHorizontallyCommand:
    case windowTileVerticallyCommand: return state.shownWindows > 1;
    default: return true;
    }
}

QString whyDisabled(unsigned command, const DeskState &state)
{
    if (command == recentFileCommand) {
        return Xlate("No file has been opened yet.");
    }
    if (needsNoReport(command)) {
        return {};
    }
    if (!state.hasReport) {
        return Xlate("No report is open.");
    }
    if (!state.isWritten) {
        return Xlate("The report is still being made.");
    }
    if (isOneOf(command, {nextReportCommand, previousReportCommand})) {
        return Xlate("No other report is open.");
    }
    if (isOneOf(command, {windowCascadeCommand, windowArrangeCommand, windowTileHorizontallyCommand,
                          windowTileVerticallyCommand}))
    {
        return Xlate("There is only one window.");
    }
    switch (command) {
    case fileSaveCommand: return Xlate("The report has no changes that are not saved.");
    case fileCloseCommand:
        return state.isHeldByEditor ? Xlate("The report is open in another program. Close it there first.") : QString();
    case fileExportCommand: return Xlate("This report was not made by a job, so its values are not known.");
    case runAgainCommand:
    case saveAsJobCommand:
    case chooseUnitsCommand: return Xlate("This report was not made by a job.");
    case updateTextCommand: return Xlate("The report was not made from an object of another program.");
    default: break;
    }
    if (state.isReportWindow) {
        return Xlate("The lines of a report window can only be read. Press View\\Edit Report.");
    }
    if (state.isLoading) {
        return Xlate("The report is still being loaded.");
    }
    switch (command) {
    case undoCommand: return Xlate("There is nothing to undo.");
    case redoCommand: return Xlate("There is nothing to redo.");
    case copyCommand:
    case cutCommand:
    case printSelectionCommand: return Xlate("No text is selected.");
    case fitWidthCommand:
    case fitPageCommand: return Xlate("The sheets are not shown. Choose View > Sheets.");
    default: return {};
    }
}

} // namespace kareport
