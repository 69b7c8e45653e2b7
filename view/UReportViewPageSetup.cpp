#include "UReportView.h"

#include "AppMessageBox.h"
#include "PageSetup.h"
#include "Preferences.h"
#include "PrintQuestions.h"
#include "ReportOrientation.h"
#include "ReportPrinter.h"
#include "ReportViewWidget.h"
#include "UPreviewDlg.h"
#include "UReportDoc.h"
#include "Xlate.h"

void UReportView::OnPageSetup()
{
    UReportDoc *report = GetDocument();
    if (report == nullptr) {
        return;
    }
    const auto orientation = kareport::reportOrientation();
    if (!kareport::hasReportPrinter()) {
        AppMessageBox(Xlate("Failed to get default printer settings."));
        return;
    }
    kareport::PageSetup setup;
    setup.margins = report->GetMargins();
    setup.portrait = UPreviewDlg::IsModulePrinterOrientationPortrait();
    setup.asksForPages = true;
    setup.givenLines = report->GetGivenLinesPerPage();
    setup.keepsGivenPages = report->IsPageFixed();
    kareport::fillPrinters(setup);
    const auto handle = GetHandle(); // the view may be destroyed while the dialog is open
    if (!kareport::askPageSetup(setup, GetWidget()) || *handle == nullptr) {
        return;
    }
    UPreviewDlg::SetModulePrinterOrientationPortrait(setup.portrait);
    kareport::selectPrinter(setup.printer, setup.sheet);
    report->SetMargins(setup.margins);
    report->UseGivenPage(setup.keepsGivenPages);
    report->SetPageSize();
    report->SaveSettings();
    showMeasuredPage();
    // After the measurement, which the next print command repeats: the report that is open keeps its pages until then.
    SetReportPrinterSetToPortrait(UPreviewDlg::IsModulePrinterOrientationPortrait());
}

/// After the page was measured: every view of the report shows what page a place is on.
void UReportView::showMeasuredPage()
{
    for (UView *view : GetDocument()->GetViews()) {
        auto *shown = dynamic_cast<UReportView *>(view);
        if (shown != nullptr && shown->widget_) {
            static_cast<kareport::ReportViewWidget *>(shown->widget_.data())->showPlace();
            shown->OnPagesForgotten();
        }
    }
}
