#pragma once

namespace kareport
{

/// Commands of a report view and of the menu of reports, by the numbers that menus name.
enum ReportCommandId : unsigned
{
    updateTextCommand = 32771,
    hostPrintCommand = 33236,
    hostPrintPreviewCommand = 33237,
    findPreviousCommand = 33240,
    goToPageCommand = 33241,
    zoomInCommand = 33242,
    zoomOutCommand = 33243,
    zoomResetCommand = 33244,
    fileNewCommand = 57600,
    fileOpenCommand = 57601,
    fileCloseCommand = 57602,
    fileSaveCommand = 57603,
    fileSaveAsCommand = 57604,
    pageSetupCommand = 57606,
    filePrintCommand = 57607,
    printDirectCommand = 57608,
    printPreviewCommand = 57609,
    recentFileCommand = 57616,
    copyCommand = 57634,
    cutCommand = 57635,
    findCommand = 57636,
    pasteCommand = 57637,
    findNextCommand = 57640,
    selectAllCommand = 57642,
    undoCommand = 57643,
    redoCommand = 57644,
    windowNewCommand = 57648,
    windowArrangeCommand = 57649,
    windowCascadeCommand = 57650,
    windowTileHorizontallyCommand = 57651,
    windowTileVerticallyCommand = 57652,
    helpAboutCommand = 57664,
    exitCommand = 57665,
    helpContentsCommand = 57670,
    viewToolBarCommand = 59392,
    viewStatusBarCommand = 59393,
    closeBoxCommand = 61536
};

} // namespace kareport
