#include "UReportDoc.h"

#include "CViewPane.h"
#include "MemoryLasts.h"
#include "ReportExit.h"
#include "ReportParts.h"
#include "ReportWindow.h"
#include "UView.h"

#include <algorithm>

bool UReportDoc::CanCloseFrame(CViewPane * /*pane*/)
{
    if (parts_->canClose == 0) {
        return false;
    }
    // A numbered pane is one of several: another one keeps the document.
    const bool isOneOfSeveral = std::any_of(GetViews().begin(), GetViews().end(), [](const UView *view) {
        return view->GetParentPane() != nullptr && view->GetParentPane()->GetWindowNumber() > 0;
    });
    return isOneOfSeveral || kareport::whileMemoryLasts(false, [this] { return SaveModified(); });
}

void UReportDoc::OnCloseDocument()
{
    CViewPane *windowPane = nullptr;
    if (GetReportWindow() != nullptr) {
        if (parts_->closeMode == 0) {
            windowPane = GetReportWindow()->GetOwningPane();
        } else if (parts_->closeMode != 2) {
            return;
        }
    }
    if (!IsSearchAndOrganizeHandler() || IsAutoDelete()) {
        UDocument::OnCloseDocument();
    }
    // The pane may have been closed with the report's views.
    if (windowPane != nullptr && CViewPane::IsOpen(windowPane)) {
        windowPane->ClosePane();
    }
}

void UReportDoc::OnAutoDelete()
{
    if (parts_->owner != nullptr) {
        parts_->owner->OnReportClosed(this);
    }
}

void UReportDoc::CloseReportDocument()
{
    const bool deferred = parts_->closeMode == 1;
    parts_->closeMode = 2;
    if (deferred) {
        kareport::noteCloseAsked(*this);
    } else {
        OnCloseDocument();
    }
}

void UReportDoc::SetCloseDocument(int mode)
{
    parts_->closeMode = mode;
}

int UReportDoc::GetCloseDocument() const
{
    return parts_->closeMode;
}

void UReportDoc::SetCloseDocumentFlag(bool on)
{
    parts_->closeDocument = on;
}

bool UReportDoc::GetCloseDocumentFlag() const
{
    return parts_->closeDocument;
}

void UReportDoc::SetCanClose(int can)
{
    parts_->canClose = can;
}

void UReportDoc::EnableCloseOption(bool on)
{
    parts_->closeOptionEnabled = on;
}

bool UReportDoc::EnableCloseOption() const
{
    return parts_->closeOptionEnabled;
}
