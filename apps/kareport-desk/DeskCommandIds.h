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
    fileExportCommand = 33254
};

} // namespace kareport
