#include "UDocument.h"

#include "AutoDeleteGuard.h"
#include "CViewPane.h"
#include "MemoryLasts.h"
#include "UApplication.h"
#include "UDocTemplate.h"
#include "UView.h"

#include <QFileInfo>
#include <QVarLengthArray>

#include <algorithm>

namespace
{

/// Without memory the pane goes on to show the title before.
void showTitle(CViewPane &pane)
{
    kareport::doneWhileMemoryLasts([&pane] { pane.UpdateTitle(); });
}

} // namespace

UDocument::UDocument() = default;

UDocument::~UDocument()
{
    for (UView *view : views_) {
        view->document_ = nullptr;
    }
    if (docTemplate_ != nullptr) {
        docTemplate_->Forget(this);
    }
    if (UApplication::Get() != nullptr) {
        UApplication::Get()->ForgetReport(this);
    }
}

void UDocument::SetTitle(const QString &title)
{
    title_ = title;
    for (const UView *view : views_) {
        if (CViewPane *pane = view->GetParentPane()) {
            pane->SetWindowTextW(title);
        }
    }
}

void UDocument::SetPathName(const QString &path, bool addToRecentFiles)
{
    // What needs memory comes first, so that a document has both the path and the name, or neither.
    kareport::doneWhileMemoryLasts([&] {
        const QString name = QFileInfo(path).fileName();
        if (addToRecentFiles && UApplication::Get() != nullptr) {
            UApplication::Get()->AddToRecentFileList(path);
        }
        path_ = path;
        UDocument::SetTitle(name);
    });
}

void UDocument::AddView(UView *view)
{
    if (!kareport::doneWhileMemoryLasts([this, view] { views_.push_back(view); })) {
        return;
    }
    view->document_ = this;
    UpdateFrameCounts();
}

void UDocument::RemoveView(UView *view)
{
    view->document_ = nullptr;
    std::erase(views_, view);
    if (views_.empty() && autoDelete_) {
        OnCloseDocument();
        return;
    }
    UpdateFrameCounts();
}

void UDocument::UpdateAllViews(UView *sender, long hint, void *hintObject)
{
    constexpr qsizetype usualViews = 32;
    const std::weak_ptr<const bool> life = life_;
    kareport::doneWhileMemoryLasts([&] {
        // A view may close itself or another one while it is updated. Few are listed without a request for memory: none of
        // them goes on to show what was there before.
        const QVarLengthArray<UView *, usualViews> views(views_.begin(), views_.end());
        for (UView *view : views) {
            if (life.expired()) {
                return; // the last view has closed the document
            }
            if (view != sender && std::find(views_.begin(), views_.end(), view) != views_.end()) {
                kareport::doneWhileMemoryLasts([&] { view->OnUpdate(sender, hint, hintObject); });
            }
        }
    });
}

void UDocument::UpdateFrameCounts()
{
    const auto visiblePane = [](const UView *view) { return view->IsVisible() ? view->GetParentPane() : nullptr; };
    for (const UView *view : views_) {
        CViewPane *pane = view->GetParentPane();
        if (visiblePane(view) != nullptr) {
            pane->SetWindowNumber(-1);
        } else if (pane != nullptr && pane->GetWindowNumber() != 0) {
            // It is not visible: it does not keep the document when the others are closed.
            pane->SetWindowNumber(0);
            showTitle(*pane);
        }
    }
    // Nothing is collected: views count again when they are destroyed, where nothing may fail.
    CViewPane *first = nullptr;
    int count = 0;
    for (const UView *view : views_) {
        CViewPane *pane = visiblePane(view);
        if (pane != nullptr && pane->GetWindowNumber() == -1) {
            first = first != nullptr ? first : pane;
            pane->SetWindowNumber(++count);
        }
    }
    if (count == 1) {
        first->SetWindowNumber(0);
    }
    for (auto view = views_.begin(); view != views_.end(); ++view) {
        CViewPane *pane = visiblePane(*view);
        const bool isUpdated = std::any_of(views_.begin(), view,
                                           [pane](const UView *earlier) { return earlier->GetParentPane() == pane; });
        if (pane != nullptr && !isUpdated) {
            showTitle(*pane);
        }
    }
}

bool UDocument::CanCloseFrame(CViewPane *pane)
{
    // Another pane keeps the document.
    const bool shownElsewhere = std::any_of(views_.begin(), views_.end(), [pane](const UView *view) {
        return view->GetParentPane() != nullptr && view->GetParentPane() != pane;
    });
    return shownElsewhere || SaveModified();
}

bool UDocument::IsShown(const CViewPane *except) const
{
    return std::any_of(views_.begin(), views_.end(), [except](const UView *view) {
        const CViewPane *pane = view->GetParentPane();
        return pane != nullptr && pane != except && pane->IsVisible();
    });
}

void UDocument::CloseAllPanes()
{
    const auto guard = kareport::withoutAutoDelete(*this);
    while (!views_.empty()) {
        UView *view = views_.front();
        if (CViewPane *pane = view->GetParentPane()) {
            pane->ClosePane();
        }
        // A view without a pane, or of a pane that only closes later, is destroyed by itself.
        if (!views_.empty() && views_.front() == view) {
            RemoveView(view);
        }
    }
}

void UDocument::OnCloseDocument()
{
    CloseAllPanes();
    EndDocument();
}

void UDocument::EndDocument()
{
    // Nothing keeps a document from going.
    kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterCloseDocument); });
    kareport::doneWhileMemoryLasts([this] { DeleteContents(); });
    if (autoDelete_) {
        kareport::doneWhileMemoryLasts([this] { OnAutoDelete(); });
        delete this;
    }
}

void UDocument::OnAutoDelete() {}

void UDocument::DeleteContents() {}

void UDocument::OnDocumentEvent(DocumentEvent event)
{
    if (UApplication::Get() != nullptr) {
        UApplication::Get()->OnDocumentEvent(*this, event);
    }
}

void UDocument::OnReportClosed(UDocument * /*report*/) {}

bool UDocument::OnTextReceived(unsigned /*id*/, const QString & /*text*/)
{
    return false;
}
