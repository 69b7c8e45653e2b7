#pragma once

#include "ReportCommandIds.h"

namespace kareport
{

/// Commands of the main window, by the numbers that menus name; a report's own are `ReportCommandId`.
enum DeskCommandId : unsigned
{
    fileFromTemplateCommand = 33250,
    preferencesCommand = 33251,
    fileNewCommand = 57600,
    fileOpenCommand = 57601,
    windowNewCommand = 57648,
    windowArrangeCommand = 57649,
    windowCascadeCommand = 57650,
    windowTileHorizontallyCommand = 57651,
    windowTileVerticallyCommand = 57652,
    helpAboutCommand = 57664,
    helpContentsCommand = 57670,
    viewToolBarCommand = 59392,
    viewStatusBarCommand = 59393
};

} // namespace kareport
