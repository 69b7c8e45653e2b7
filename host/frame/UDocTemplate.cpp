#include "UDocTemplate.h"

#include "AutoDeleteGuard.h"
#include "CViewPane.h"
#include "MemoryLasts.h"
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

void updateFirst(CViewPane &pane, UDocument &document, bool makeVisible)
{
    for (const auto &view : pane.GetViews()) {
        if (view->GetDocument() == &document) {
            view->OnInitialUpdate();
        }
    }
    if (makeVisible) {
        pane.ShowPane(true);
    }
    document.UpdateFrameCounts();
}

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

    // Like the template's functions of these names, but that they throw when memory ends: without a pane of its own, a
    // document would be made that is not shown.
    static UDocument *open(UDocTemplate &docTemplate, const QString &path, bool makeVisible, CViewPane *pane,
                           unsigned style, const QRect *rect);
    static CViewPane *createPane(UDocTemplate &docTemplate, UDocument *document, CViewPane *parent, unsigned style,
                                 const QRect *rect);
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
    return kareport::whileMemoryLasts<UDocument *>(
        nullptr, [&] { return UnfinishedDocument::open(*this, path, makeVisible != 0, pane, style, rect); });
}

UDocument *UDocTemplate::UnfinishedDocument::open(UDocTemplate &docTemplate, const QString &path, bool makeVisible,
                                                  CViewPane *pane, unsigned style, const QRect *rect)
{
    std::unique_ptr<UDocument> made = docTemplate.makeDocument_();
    if (!made) {
        return nullptr;
    }
    UDocument *document = made.get();
    docTemplate.documents_.push_back(document);
    document->docTemplate_ = &docTemplate;
    UnfinishedDocument unfinished(made.release(), pane);
    // While it is being filled, the document must not be destroyed with a pane that closes.
    const bool autoDelete = document->IsAutoDelete();
    document->SetAutoDelete(false);

    UnfinishedPane ownPane(nullptr, {document});
    if (pane == nullptr) {
        pane = createPane(docTemplate, document, nullptr, style, rect);
        ownPane.reset(pane);
    } else {
        docTemplate.ShowIn(pane, document);
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
        updateFirst(*pane, *document, makeVisible);
    }
    static_cast<void>(ownPane.release()); // it owns itself now
    unfinished.document = nullptr;
    document->SetAutoDelete(autoDelete);
    return document;
}

CViewPane *UDocTemplate::CreateNewPane(UDocument *document, CViewPane *parent, unsigned style, const QRect *rect)
{
    return kareport::whileMemoryLasts<CViewPane *>(
        nullptr, [&] { return UnfinishedDocument::createPane(*this, document, parent, style, rect); });
}

CViewPane *UDocTemplate::UnfinishedDocument::createPane(UDocTemplate &docTemplate, UDocument *document,
                                                        CViewPane *parent, unsigned style, const QRect *rect)
{
    if (!docTemplate.makePane_ || !docTemplate.makeView_) {
        return nullptr;
    }
    UnfinishedPane pane(docTemplate.makePane_(), {document});
    if (pane) {
        pane->SetPlace(parent, style, rect);
        docTemplate.ShowIn(pane.get(), document);
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
        if (pane->GetActiveView() != shown) {
            throw std::bad_alloc(); // the pane had no memory for it
        }
        document->AddView(shown);
        if (shown->GetDocument() != document) {
            pane->RemoveView(shown); // a view without a document would stay in a pane that is given
            throw std::bad_alloc();
        }
    }
}

void UDocTemplate::InitialUpdatePane(CViewPane *pane, UDocument *document, int makeVisible)
{
    kareport::doneWhileMemoryLasts([&] { updateFirst(*pane, *document, makeVisible != 0); });
}

void UDocTemplate::Forget(UDocument *document)
{
    std::erase(documents_, document);
}
