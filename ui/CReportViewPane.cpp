#include "CReportViewPane.h"

#include "AppMessageBox.h"
#include "ReportViewPort.h"
#include "UReportDoc.h"
#include "UView.h"
#include "Xlate.h"

bool CReportViewPane::CanClosePane()
{
    auto *report = dynamic_cast<UReportDoc *>(GetActiveDocument());
    return report == nullptr || report->CanCloseFrame(this);
}

void CReportViewPane::OnSysCommand(unsigned command, long parameter)
{
    const UView *view = GetViews().empty() ? nullptr : GetViews().back().get();
    const bool showsReport = dynamic_cast<const kareport::ReportViewPort *>(view) != nullptr;
    const auto *report = showsReport ? dynamic_cast<const UReportDoc *>(view->GetDocument()) : nullptr;
    if (command == scClose && report != nullptr && !report->EnableCloseOption()) {
        kareport::showMessage({Xlate("The Report can only be closed when the associated editor is closed"),
                               Xlate("Error@@Alert Message title"), MessageButtons::Ok,
                               kareport::MessageIcon::Information});
        return;
    }
    COneViewPane::OnSysCommand(command, parameter);
}
