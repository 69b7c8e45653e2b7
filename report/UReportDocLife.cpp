#include "UReportDoc.h"

#include "CViewPane.h"
#include "MemoryLasts.h"
#include "ReportExit.h"
#include "ReportViews.h"
#include "ReportWindow.h"
#include "TextFolding.h"
#include "UDocTemplate.h"
#include "UView.h"

#include "ReportEntry.h"

#include <algorithm>

using kareport::showsReport;

namespace
{

/// Whether a pane has the title as its caption. No title is nobody's.
bool isTaken(const QString &title, const QStringList &captions)
{
    if (title.isEmpty()) {
        return false;
    }
    return std::any_of(captions.begin(), captions.end(),
                       [&title](const QString &caption) { return kareport::equalFolded(title, caption); });
}

} // namespace

void UReportDoc::SetTitle(const QString &title)
{
    page_.losesNothing([&] {
        const QString given = title; // may be the very title that is numbered below
        title_ = given;
        SetHeader();
        QStringList captions;
        CViewPane::GetPaneCaptions(captions, this);
        for (int number = 2; isTaken(title_, captions); ++number) {
            title_ = given + u' ' + QString::number(number);
        }
        UDocument::SetTitle(title_);
    });
}

void UReportDoc::SetWindowTextW(const QString &text)
{
    if (GetViews().empty() || !showsReport(GetViews().front())) {
        return;
    }
    if (CViewPane *pane = GetViews().front()->GetParentPane()) {
        pane->SetWindowTextW(text);
    }
}

CViewPane *UReportDoc::GetFrameWindow() const
{
    for (const UView *view : GetViews()) {
        if (showsReport(view)) {
            return view->GetParentPane();
        }
    }
    return nullptr;
}

void UReportDoc::openOwnPane()
{
    if (UDocTemplate *reportTemplate = GetReportTemplate()) {
        if (CViewPane *pane = reportTemplate->CreateNewPane(this, nullptr, ownPaneStyle, nullptr)) {
            reportTemplate->InitialUpdatePane(pane, this, 1);
            kareport::noteOwnPane(*pane, true);
        }
    }
}

void UReportDoc::Activate(bool /*reserved*/)
{
    kareport::doneWhileMemoryLasts([this] { openOwnPane(); });
    UpdateAllViews(nullptr, 0, nullptr);
}

bool UReportDoc::OnNewDocument()
{
    if (!UDocument::OnNewDocument()) {
        return false;
    }
    SetPageSize();
    return true;
}

bool UReportDoc::CanCloseFrame(CViewPane * /*pane*/)
{
    if (canClose_ == 0) {
        return false;
    }
    // A numbered pane is one of several: another one keeps the document.
    for (const UView *view : GetViews()) {
        if (view->GetParentPane() != nullptr && view->GetParentPane()->GetWindowNumber() > 0) {
            return true;
        }
    }
    return kareport::whileMemoryLasts(false, [this] { return SaveModified(); });
}

bool UReportDoc::IsShown(const CViewPane *except) const
{
    CViewPane *window = reportWindow_ != nullptr ? reportWindow_->GetOwningPane() : nullptr;
    return (window != nullptr && window->IsVisible()) || UDocument::IsShown(except);
}

void UReportDoc::CloseReportDocument()
{
    const bool deferred = closeMode_ == 1;
    closeMode_ = 2;
    if (deferred) {
        kareport::noteCloseAsked(*this);
    } else {
        OnCloseDocument();
    }
}

void UReportDoc::OnCloseDocument()
{
    CViewPane *windowPane = nullptr;
    if (reportWindow_ != nullptr) {
        if (closeMode_ == 0) {
            windowPane = reportWindow_->GetOwningPane();
        } else if (closeMode_ != 2) {
            return;
        }
    }
    if (!IsSearchAndOrganizeHandler() || IsAutoDelete()) {
        UDocument::OnCloseDocument();
    }
    // The pane may have gone with the report's views.
    if (windowPane != nullptr && CViewPane::IsOpen(windowPane)) {
        windowPane->ClosePane();
    }
}

void UReportDoc::OnAutoDelete()
{
    if (owner_ != nullptr) {
        owner_->OnReportClosed(this);
    }
}
