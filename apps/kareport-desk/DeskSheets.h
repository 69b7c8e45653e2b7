#pragma once

#include "SheetReportView.h"

#include <vector>

class UXTPMDIFrameWnd;

namespace kareport
{

struct ReportMenu;

/// How the user looks at reports. It is kept for those that are opened next.
struct SheetChoices
{
    SheetReportView::Shows shows = SheetReportView::Shows::Text;
    bool thumbnails = true;
    bool pageLines = false;
};

SheetChoices loadSheetChoices();
void saveSheetChoices(const SheetChoices &choices);
/// Makes a view show what the user has chosen.
void showAsChosen(SheetReportView &view);

/// The commands that are about sheets, pages on the screen, and printing a part.
std::vector<Command> sheetCommands(UXTPMDIFrameWnd &frame);
/// Adds them to the menus.
void addSheetMenu(UXTPMDIFrameWnd &frame, const ReportMenu &menu);
/// The paper of all reports may be another one: views of sheets ask for it again.
void restartAllSheets();

} // namespace kareport
