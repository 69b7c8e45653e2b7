#include "NewReport.h"

#include "ReportEntry.h"
#include "UReportDoc.h"

namespace kareport
{

UReportDoc *openNewReport(const NewReport &report, bool show, CViewPane *pane, unsigned style, const QRect *rect)
{
    UDocTemplate *reportTemplate = GetReportTemplate();
    if (reportTemplate == nullptr) {
        return nullptr;
    }
    const int shown = show ? 1 : 0;
    auto *made =
        dynamic_cast<UReportDoc *>(reportTemplate->OpenReportDocumentFile(QString(), shown, shown, pane, style, rect));
    if (made == nullptr) {
        return nullptr;
    }
    if (!report.name.isNull()) {
        made->SetTitle(report.name);
        made->SetReportFileName(report.name);
    }
    made->SetHeaderFlag(report.headerFlag);
    made->SetExternalEditorFlag(report.externalEditor);
    return made;
}

} // namespace kareport
