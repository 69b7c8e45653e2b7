#include "UDocument.h"

#include "AppMessageBox.h"
#include "AutoDeleteGuard.h"
#include "CViewPane.h"
#include "ReplaceFile.h"
#include "UApplication.h"
#include "UArchive.h"
#include "UDocTemplate.h"
#include "UView.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>

#include <algorithm>

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
    path_ = path;
    UDocument::SetTitle(QFileInfo(path).fileName());
    if (addToRecentFiles && UApplication::Get() != nullptr) {
        UApplication::Get()->AddToRecentFileList(path);
    }
}

void UDocument::AddView(UView *view)
{
    views_.push_back(view);
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
    // A view may close itself or another one while it is updated.
    const std::vector<UView *> views = views_;
    const std::weak_ptr<const bool> life = life_;
    for (UView *view : views) {
        if (life.expired()) {
            return; // the last view has closed the document
        }
        if (view != sender && std::find(views_.begin(), views_.end(), view) != views_.end()) {
            view->OnUpdate(sender, hint, hintObject);
        }
    }
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
            pane->UpdateTitle();
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
            pane->UpdateTitle();
        }
    }
}

bool UDocument::OnNewDocument()
{
    DeleteContents();
    path_.clear();
    SetModifiedFlag(false);
    OnDocumentEvent(DocumentEvent::AfterNewDocument);
    return true;
}

bool UDocument::OnOpenDocument(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    DeleteContents();
    SetModifiedFlag(true); // until all of it has been read
    UArchive archive(file, UArchive::Mode::Loading, QFileInfo(path).absoluteFilePath());
    const std::weak_ptr<const bool> life = life_;
    Serialize(archive);
    if (life.expired()) {
        return false; // what took the text has closed the document
    }
    if (!archive.IsGood()) {
        DeleteContents();
        return false;
    }
    SetModifiedFlag(false);
    OnDocumentEvent(DocumentEvent::AfterOpenDocument);
    return true;
}

bool UDocument::OnSaveDocument(const QString &path)
{
    const bool saved = kareport::replaceFile(path, [&](QIODevice &device) {
        UArchive archive(device, UArchive::Mode::Storing, QFileInfo(path).absoluteFilePath());
        Serialize(archive);
        return archive.IsGood();
    });
    if (saved) {
        SetModifiedFlag(false);
        OnDocumentEvent(DocumentEvent::AfterSaveDocument);
    }
    return saved;
}

void UDocument::Serialize(UArchive & /*archive*/) {}

bool UDocument::DoSave(const QString &path, bool replace)
{
    if (path.isEmpty() || !OnSaveDocument(path)) {
        return false;
    }
    if (replace) {
        SetPathName(path, true);
    }
    return true;
}

bool UDocument::DoFileSave()
{
    return DoSave(path_, path_.isEmpty());
}

bool UDocument::SaveModified()
{
    if (!IsModified()) {
        return true;
    }
    const QString question = Xlate("Save changes to %1?").arg(title_.isEmpty() ? Xlate("Untitled") : title_);
    const std::weak_ptr<const bool> life = life_;
    const MessageAnswer answer = AppMessageBox(question, MessageButtons::YesNoCancel);
    if (life.expired()) {
        return false; // it was closed while the question was open: there is nothing left to save or to close
    }
    switch (answer) {
    case MessageAnswer::Yes: return DoFileSave();
    case MessageAnswer::No: return true;
    default: return false;
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
    OnDocumentEvent(DocumentEvent::AfterCloseDocument);
    DeleteContents();
    if (autoDelete_) {
        OnAutoDelete();
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
