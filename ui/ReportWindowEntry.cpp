#include "ReportWindowEntry.h"

#include "MemoryLasts.h"
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
    const bool isMade = report != nullptr && kareport::doneWhileMemoryLasts([&] {
                            auto window = std::make_unique<UReportWindowDlg>();
                            if (window->createDocked(name, activeView.get())) {
                                window->SetReportDoc(report);
                                report->SetReportWindow(window.release());
                            }
                        });
    if (report != nullptr && !isMade) {
        report->OnCloseDocument();
        report = nullptr;
    }
    activeView.reactivate();
    return report;
}
