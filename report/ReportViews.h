#pragma once

#include "ReportViewPort.h"
#include "UReportDoc.h"

#include <vector>

class UView;

namespace kareport
{

/// Whether a view shows the text of a report.
bool showsReport(const UView *view);
/// The views that show a report's text, in their order.
std::vector<UView *> reportViews(const UReportDoc &report);

} // namespace kareport
