#pragma once

#include "KaReportExport.h"
#include "ReportViewPort.h"
#include "UReportDoc.h"

#include <vector>

class CViewPane;
class UView;

namespace kareport
{

/// Whether a view shows the text of a report.
bool showsReport(const UView *view);
/// The views that show a report's text, in their order.
std::vector<UView *> reportViews(const UReportDoc &report);
/// Lets the views of a report that load its text in pieces load the rest at once, so that all of it is
/// saved. Where there is no memory for that, they go on in pieces.
void finishLoading(const UReportDoc &report);

/// Opens a new pane for a report, and notes that it is the report's own. Nothing without the template for reports.
void openOwnPane(UReportDoc &report);
/// Notes that the report has made a pane for itself. @param shown  whether it is shown as well
void noteOwnPane(const CViewPane &pane, bool shown);
/// Shows or hides a pane in which the report is, and notes of one of its own that it did.
void showReportPane(CViewPane &pane, bool show);
/// Closes those of a report's own panes that it keeps hidden. What a host hides is the host's to close.
void closeOwnHiddenPanes(const UReportDoc &report);

} // namespace kareport
