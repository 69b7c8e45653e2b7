#include "NewReport.h"

#include "AutoDeleteGuard.h"
#include "CViewPane.h"
#include "MemoryLasts.h"
#include "ReportEntry.h"
#include "ReportViews.h"
#include "UReportDoc.h"

namespace kareport
{

namespace
{

/// Closes a report that could not be made. A pane that was given stays, with the views of others in it.
void discard(UReportDoc &report, CViewPane *given)
{
    {
        const auto guard = withoutAutoDelete(report);
        while (given != nullptr && CViewPane::IsOpen(given) && !report.GetViews().empty()) {
            given->RemoveView(report.GetViews().front());
        }
    }
    report.OnCloseDocument();
}

} // namespace

UReportDoc *openNewReport(const NewReport &report, bool show, CViewPane *pane, unsigned style, const QRect *rect)
{
    const int shown = show ? 1 : 0;
    auto *made = whileMemoryLasts<UReportDoc *>(nullptr, [&]() -> UReportDoc * {
        UDocTemplate *reportTemplate = GetReportTemplate();
        return reportTemplate == nullptr ? nullptr
                                         : dynamic_cast<UReportDoc *>(reportTemplate->OpenReportDocumentFile(
                                               QString(), shown, shown, pane, style, rect));
    });
    if (made == nullptr) {
        return nullptr;
    }
    if (CViewPane *own = pane == nullptr ? made->GetFrameWindow() : nullptr) {
        noteOwnPane(*own, show);
    }
    if (!report.name.isNull()) {
        made->SetTitle(report.name);
        made->SetReportFileName(report.name);
    }
    if (made->HasLostText()) {
        discard(*made, pane); // its title or its page header could not be made
        return nullptr;
    }
    made->SetHeaderFlag(report.headerFlag);
    made->SetExternalEditorFlag(report.externalEditor);
    return made;
}

} // namespace kareport
