#include "ReportExit.h"

#include "ReportEntry.h"
#include "UReportDoc.h"

#include <algorithm>
#include <vector>

namespace
{

/// A report whose closing an exit has deferred.
struct DeferredReport
{
    UReportDoc *report;
    int closeMode; ///< before the exit
    bool isAskedToClose;
};

std::vector<DeferredReport> &deferredReports()
{
    static std::vector<DeferredReport> reports;
    return reports;
}

auto placeOf(const UReportDoc &report)
{
    return std::find_if(deferredReports().begin(), deferredReports().end(),
                        [&report](const DeferredReport &deferred) { return deferred.report == &report; });
}

} // namespace

void kareport::deferCloseForExit(UReportDoc &report)
{
    if (const auto place = placeOf(report); place != deferredReports().end()) {
        place->isAskedToClose = false; // the exit before was not taken back, and is not what the host has set
    } else {
        deferredReports().push_back({&report, report.GetCloseDocument(), false});
    }
    report.SetCloseDocument(1);
}

void kareport::noteCloseAsked(const UReportDoc &report)
{
    if (const auto place = placeOf(report); place != deferredReports().end()) {
        place->isAskedToClose = true;
    }
}

void kareport::forgetExit(const UReportDoc &report)
{
    if (const auto place = placeOf(report); place != deferredReports().end()) {
        deferredReports().erase(place);
    }
}

void kareport::noteExitCancelled()
{
    // A report that closes may close others, which leave the list.
    while (!deferredReports().empty()) {
        const DeferredReport deferred = deferredReports().back();
        deferredReports().pop_back();
        if (deferred.isAskedToClose && deferred.closeMode == 1) {
            deferred.report->SetCloseDocument(2); // the host defers it as well: it is the next request that closes
        } else if (deferred.isAskedToClose) {
            deferred.report->CloseReportDocument();
        } else {
            deferred.report->SetCloseDocument(deferred.closeMode);
        }
    }
}
