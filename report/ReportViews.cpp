#include "ReportViews.h"

#include "UView.h"

#include <algorithm>
#include <iterator>

namespace kareport
{

bool showsReport(const UView *view)
{
    return dynamic_cast<const ReportViewPort *>(view) != nullptr;
}

std::vector<UView *> reportViews(const UReportDoc &report)
{
    std::vector<UView *> views;
    std::copy_if(report.GetViews().begin(), report.GetViews().end(), std::back_inserter(views), showsReport);
    return views;
}

} // namespace kareport
