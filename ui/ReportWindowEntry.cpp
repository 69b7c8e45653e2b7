#include "ReportWindowEntry.h"

#include "NewReport.h"
#include "RememberedView.h"
#include "UReportDoc.h"
#include "UReportWindowDlg.h"

#include <memory>

UReportDoc *CreateReportWindow(const QString &name, bool headerFlag, bool externalEditor)
{
    const kareport::RememberedView activeView = kareport::RememberedView::active();
    UReportDoc *report =
        kareport::openNewReport({name, headerFlag, externalEditor}, false, nullptr, UReportDoc::ownPaneStyle, nullptr);
    if (report != nullptr) {
        auto window = std::make_unique<UReportWindowDlg>();
        if (window->createDocked(name, activeView.get())) {
            window->SetReportDoc(report);
            report->SetReportWindow(window.release());
        }
    }
    activeView.reactivate();
    return report;
}
