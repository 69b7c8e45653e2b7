#include "UDocTemplate.h"

#include "AutoDeleteGuard.h"
#include "CViewPane.h"
#include "UDocument.h"
#include "UView.h"

#include <algorithm>
#include <new>

namespace
{

/// Closes a pane whose document stays.
struct CloseUnfinishedPane
{
    UDocument *document;
    void operator()(CViewPane *pane) const
    {
        if (!CViewPane::IsOpen(pane)) {
            return;
        }
        const auto guard = kareport::withoutAutoDelete(*document);
        pane->ClosePane();
    }
};
using UnfinishedPane = std::unique_ptr<CViewPane, CloseUnfinishedPane>;

} // namespace

/// A document that is being made: it is destroyed, with its views, if that fails.
struct UDocTemplate::UnfinishedDocument
{
    UDocument *document;
    CViewPane *pane; ///< that was given; null for one of its own

    UnfinishedDocument(UDocument *made, CViewPane *given) : document(made), pane(given) {}
    ~UnfinishedDocument()
    {
        while (document != nullptr && CViewPane::IsOpen(pane) && !document->GetViews().empty()) {
            pane->RemoveView(document->GetViews().front());
        }
        delete document;
    }
    UnfinishedDocument(const UnfinishedDocument &) = delete;
    UnfinishedDocument &operator=(const UnfinishedDocument &) = delete;
};

UDocTemplate::UDocTemplate(unsigned resourceId, DocumentFactory makeDocument, PaneFactory makePane,
                           ViewFactory makeView, QString creatorName, int /*savesInFrame*/, int /*reserved*/)
    : resourceId_(resourceId),
      makeDocument_(std::move(makeDocument)),
      makePane_(std::move(makePane)),
      makeView_(std::move(makeView)),
      creatorName_(std::move(creatorName))
{}

UDocTemplate::~UDocTemplate()
{
    CloseAllDocuments();
}

void UDocTemplate::CloseAllDocuments()
{
    while (!documents_.empty()) {
        UDocument *document = documents_.back();
        document->SetAutoDelete(true);
        document->OnCloseDocument();
        // A document that defers its closing is destroyed too.
        if (!documents_.empty() && documents_.back() == document) {
            document->CloseAllPanes();
            document->EndDocument();
        }
    }
}

UDocument *UDocTemplate::OpenReportDocumentFile(const QString &path, int /*addToFrame*/, int makeVisible,
                                                CViewPane *pane, unsigned style, const QRect *rect)
{
    std::unique_ptr<UDocument> made = makeDocument_();
    if (!made) {
        return nullptr;
    }
    UDocument *document = made.get();
    document->docTemplate_ = this;
    documents_.push_back(document);
    UnfinishedDocument unfinished(made.release(), pane);
    // While it is being filled, the document must not be destroyed with a pane that closes.
    const bool autoDelete = document->IsAutoDelete();
    document->SetAutoDelete(false);

    UnfinishedPane ownPane(nullptr, {document});
    if (pane == nullptr) {
        pane = CreateNewPane(document, nullptr, style, rect);
        ownPane.reset(pane);
    } else {
        ShowIn(pane, document);
    }
    if (path.isEmpty() ? !document->OnNewDocument() : !document->OnOpenDocument(path)) {
        return nullptr;
    }
    if (!path.isEmpty()) {
        document->SetPathName(path, true);
        if (document->GetPathName().isEmpty()) {
            return nullptr; // there is no memory for it, and what is saved later would go elsewhere
        }
    }
    if (CViewPane::IsOpen(pane)) {
        InitialUpdatePane(pane, document, makeVisible);
    }
    static_cast<void>(ownPane.release()); // it owns itself now
    unfinished.document = nullptr;
    document->SetAutoDelete(autoDelete);
    return document;
}

CViewPane *UDocTemplate::CreateNewPane(UDocument *document, CViewPane *parent, unsigned style, const QRect *rect)
{
    if (!makePane_ || !makeView_) {
        return nullptr;
    }
    UnfinishedPane pane(makePane_(), {document});
    if (pane) {
        pane->SetPlace(parent, style, rect);
        ShowIn(pane.get(), document);
        // Not through the document's own SetTitle, which a report takes for a new title.
        pane->SetWindowTextW(static_cast<const UDocument *>(document)->GetTitle());
    }
    return pane.release();
}

void UDocTemplate::ShowIn(CViewPane *pane, UDocument *document)
{
    std::unique_ptr<UView> view = makeView_ ? makeView_() : nullptr;
    if (view) {
        UView *shown = view.get();
        pane->AddView(std::move(view));
        try {
            document->AddView(shown);
        } catch (const std::bad_alloc &) {
            pane->RemoveView(shown); // a view without a document would stay in a pane that is given
            throw;
        }
    }
}

void UDocTemplate::InitialUpdatePane(CViewPane *pane, UDocument *document, int makeVisible)
{
    for (const auto &view : pane->GetViews()) {
        if (view->GetDocument() == document) {
            view->OnInitialUpdate();
        }
    }
    if (makeVisible != 0) {
        pane->ShowPane(true);
    }
    document->UpdateFrameCounts();
}

void UDocTemplate::Forget(UDocument *document)
{
    std::erase(documents_, document);
}
