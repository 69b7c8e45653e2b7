#include "NewReport.h"

#include "MemoryLasts.h"
#include "ReportEntry.h"
#include "UReportDoc.h"

namespace kareport
{

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
    if (!report.name.isNull()) {
        made->SetTitle(report.name);
        made->SetReportFileName(report.name);
    }
    if (made->HasLostText()) {
        made->OnCloseDocument(); // its title or its page header could not be made
        return nullptr;
    }
    made->SetHeaderFlag(report.headerFlag);
    made->SetExternalEditorFlag(report.externalEditor);
    return made;
}

} // namespace kareport
