#pragma once

#include "ReportCommandIds.h"

namespace kareport
{

/// Commands of the main window in addition to those of the menu of reports (`ReportCommandId`).
enum DeskCommandId : unsigned
{
    fileFromTemplateCommand = 33250,
    preferencesCommand = 33251,
    nextReportCommand = 33252,
    previousReportCommand = 33253,
    fileExportCommand = 33254,
    viewSheetsCommand = 33270,
    viewSheetsBesideCommand = 33271,
    viewThumbnailsCommand = 33272,
    viewPageLinesCommand = 33273,
    fitWidthCommand = 33274,
    fitPageCommand = 33275,
    printSelectionCommand = 33276,
    runAgainCommand = 33280,
    runWhenChangedCommand = 33281,
    saveAsJobCommand = 33282,
    viewUnitsBarCommand = 33283,
    chooseUnitsCommand = 33284,
    viewNotesCommand = 33285,
    goToNotesCommand = 33286,
    exportPdfCommand = 33290,
    exportRichTextCommand = 33291,
    exportTextCommand = 33292,
    commandListCommand = 33293,
    keepReportWindowCommand = 33294
};

} // namespace kareport
