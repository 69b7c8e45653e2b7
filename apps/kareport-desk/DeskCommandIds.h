#pragma once

#include "ReportCommandIds.h"

namespace kareport
{

/// Commands of the main window beside those of the menu of reports (`ReportCommandId`).
enum DeskCommandId : unsigned
{
    fileFromTemplateCommand = 33250,
    preferencesCommand = 33251
};

} // namespace kareport
