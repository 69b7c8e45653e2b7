#include "RememberedView.h"
#include "ReportWindowCommands.h"
#include "UReportWindowDlg.h"

#include "AppMessageBox.h"
#include "CPropertyPane.h"
#include "CViewPane.h"
#include "ReportEntry.h"
#include "ReportGuards.h"
#include "ReportSaveName.h"
#include "ReportViews.h"
#include "SaveDialog.h"
#include "UDocTemplate.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "Xlate.h"

namespace kareport
{

UReportView *firstReportView(const UReportDoc &report)
{
    for (UView *view : report.GetViews()) {
        if (auto *reportView = dynamic_cast<UReportView *>(view)) {
            return reportView;
        }
    }
    return nullptr;
}

} // namespace kareport

void UReportWindowDlg::OnUpdateSave(kareport::CommandState &state)
{
    SetCaptionState(active_ ? captionHighlighted : captionPlain);
    const UReportDoc *report = GetReportDoc();
    state.enabled = active_ && report != nullptr && report->IsModified();
}

void UReportWindowDlg::OnUpdatePrint(kareport::CommandState &state)
{
    state.enabled = active_ && GetReportDoc() != nullptr;
}

void UReportWindowDlg::OnUpdateShowReport(kareport::CommandState &state)
{
    OnUpdatePrint(state);
}

void UReportWindowDlg::OnSave()
{
    UReportDoc *report = GetReportDoc();
    if (report == nullptr) {
        return;
    }
    const auto path = kareport::askReportName(*report, false);
    if (!path) {
        return;
    }
    // The report may have been closed while the dialog was open, or by what its views do when it is saved.
    if (!UReportDoc::IsReportAvailable(report)) {
        return;
    }
    const bool isSaved = report->OnSaveDocument(*path);
    const bool isOpen = UReportDoc::IsReportAvailable(report);
    if (!isSaved) {
        kareport::saySaveFailed(*path, isOpen ? report->GetSaveProblem() : QString());
    } else if (isOpen) {
        report->SetModifiedFlag(false);
    }
}

void UReportWindowDlg::leaveForReport()
{
    UReportDoc::ShowReportBar(this, false);
    ClosePane();
    previousView_->reactivate();
}

void UReportWindowDlg::OnPrint()
{
    UReportDoc *report = GetReportDoc();
    if (report == nullptr) {
        return;
    }
    leaveForReport();
    UDocTemplate *reportTemplate = GetReportTemplate();
    if (reportTemplate == nullptr) {
        report->SetExternalEditorFlag(false); // without its template the report has no editor to go to either
        return;
    }
    // The report is to open in the application, to be printed from there.
    const auto guard = kareport::withoutEditor(*report);
    if (CViewPane *pane = reportTemplate->CreateNewPane(report, nullptr, UReportDoc::ownPaneStyle, nullptr)) {
        reportTemplate->InitialUpdatePane(pane, report, 0);
        kareport::noteOwnPane(*pane, false);
    }
    report->UpdateAllViews(nullptr, 0, nullptr);
    // Views that are updated, and the user who prints, may close the report, and this window with it.
    UReportView *view = UReportDoc::IsReportAvailable(report) ? kareport::firstReportView(*report) : nullptr;
    if (view != nullptr) {
        view->UpdateData(true);
        view->OnReportPrint();
    }
}

void UReportWindowDlg::ShowReport()
{
    UReportDoc *report = GetReportDoc();
    if (report == nullptr) {
        return;
    }
    leaveForReport();
    if (!report->UsePreferredReportEditor()) {
        UDocTemplate *reportTemplate = GetReportTemplate();
        if (reportTemplate == nullptr) {
            return;
        }
        if (CViewPane *pane = reportTemplate->CreateNewPane(report, nullptr, UReportDoc::ownPaneStyle, nullptr)) {
            reportTemplate->InitialUpdatePane(pane, report, 1);
            kareport::noteOwnPane(*pane, true);
            kareport::closeOwnHiddenPanes(*report); // the report is now in one that is shown
            // The pane in front is the new one: the report's first pane may be one that the host has hidden.
            report->UDocument::UpdateAllViews(nullptr, 0, nullptr);
            CPropertyPane::UpdateAllPropertyPane(UReportDoc::IsReportAvailable(report) ? report : nullptr);
            return;
        }
    }
    report->UpdateAllViews(nullptr, 0, nullptr);
}

bool UReportWindowDlg::IsGivenUp() const
{
    const UReportDoc *report = GetReportDoc();
    return givenUp_ && report != nullptr && *givenUp_ == std::pair(report->GetEditCount(), report->GetTextLength());
}

void UReportWindowDlg::OnPressCloseButton()
{
    const QPointer<QObject> alive(&life_);
    const UReportDoc *report = GetReportDoc();
    if (report != nullptr && report->IsModified()) {
        QString question = Xlate("Save changes");
        if (!GetWindowTextW().isEmpty()) {
            question += u' ' + Xlate("to") + u' ' + GetWindowTextW();
        }
        question += u'?';
        const MessageAnswer answer =
            kareport::showMessage({question, QString(), MessageButtons::YesNo, kareport::MessageIcon::Question});
        if (answer == MessageAnswer::Yes && alive) {
            OnSave();
        }
        if (!alive) {
            return; // the report was closed meanwhile, and this window with it
        }
        givenUp_.reset();
        if (answer == MessageAnswer::No && GetReportDoc() != nullptr) {
            givenUp_.emplace(GetReportDoc()->GetEditCount(), GetReportDoc()->GetTextLength());
        }
    }
    if (GetReportDoc() != nullptr) {
        UReportDoc::ShowReportBar(this, false);
    }
    ClosePane();
    previousView_->reactivate();
}
