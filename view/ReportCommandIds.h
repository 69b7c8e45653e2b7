#pragma once

namespace kareport
{

/// Commands of a report view, by the numbers that menus name.
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
    fileCloseCommand = 57602,
    fileSaveCommand = 57603,
    fileSaveAsCommand = 57604,
    pageSetupCommand = 57606,
    filePrintCommand = 57607,
    printDirectCommand = 57608,
    printPreviewCommand = 57609,
    copyCommand = 57634,
    cutCommand = 57635,
    findCommand = 57636,
    pasteCommand = 57637,
    findNextCommand = 57640,
    selectAllCommand = 57642,
    undoCommand = 57643,
    redoCommand = 57644,
    exitCommand = 57665,
    closeBoxCommand = 61536
};

} // namespace kareport
