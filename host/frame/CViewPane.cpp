#include "CViewPane.h"

#include "MemoryLasts.h"
#include "UDocument.h"
#include "UView.h"

#include <algorithm>

namespace
{

std::vector<const CViewPane *> &openPanes()
{
    static std::vector<const CViewPane *> panes;
    return panes;
}

} // namespace

CViewPane::CViewPane()
{
    openPanes().push_back(this);
}

CViewPane::~CViewPane()
{
    std::erase(openPanes(), this);
    views_.clear(); // while the pane is still complete: its views ask for it when they are destroyed
}

bool CViewPane::IsOpen(const CViewPane *pane)
{
    return std::find(openPanes().begin(), openPanes().end(), pane) != openPanes().end();
}

void CViewPane::SetPlace(CViewPane * /*parent*/, unsigned style, const QRect *rect)
{
    style_ = style;
    rect_ = rect != nullptr ? std::optional(*rect) : std::nullopt;
}

void CViewPane::RemoveView(UView *view)
{
    std::erase_if(views_, [view](const auto &held) { return held.get() == view; });
}

void CViewPane::AddView(std::unique_ptr<UView> view)
{
    view->pane_ = this;
    kareport::doneWhileMemoryLasts([&] { views_.push_back(std::move(view)); });
}

UDocument *CViewPane::GetActiveDocument() const
{
    return views_.empty() ? nullptr : views_.back()->GetDocument();
}

void CViewPane::SetWindowTextW(const QString &text)
{
    text_ = text;
    kareport::doneWhileMemoryLasts([this] { UpdateTitle(); });
}

QString CViewPane::GetCaption() const
{
    return windowNumber_ > 0 ? text_ + u':' + QString::number(windowNumber_) : text_;
}

void CViewPane::UpdateTitle() {}

void CViewPane::ShowPane(bool show)
{
    const bool changes = visible_ != show;
    visible_ = show;
    if (changes) {
        CountAgain();
    }
}

void CViewPane::CountAgain()
{
    for (auto view = views_.begin(); view != views_.end(); ++view) {
        UDocument *document = (*view)->GetDocument();
        const bool isCounted = std::any_of(
            views_.begin(), view, [document](const auto &earlier) { return earlier->GetDocument() == document; });
        if (document != nullptr && !isCounted) {
            document->UpdateFrameCounts();
        }
    }
}

bool CViewPane::Shows(const UDocument *document) const
{
    return std::any_of(views_.begin(), views_.end(),
                       [document](const auto &view) { return view->GetDocument() == document; });
}

void CViewPane::BringToTop() {}

bool CViewPane::CanClosePane()
{
    UDocument *document = GetActiveDocument();
    return document == nullptr || document->CanCloseFrame(this);
}

void CViewPane::ClosePane()
{
    // The pane is no longer open while its views are destroyed: a document that closes with its last view must not
    // close it again.
    if (std::erase(openPanes(), this) == 0) {
        return;
    }
    views_.clear();
    delete this;
}

void CViewPane::GetPaneCaptions(QStringList &captions, const UDocument *except)
{
    captions.clear();
    for (const CViewPane *pane : openPanes()) {
        if (pane->HasDocumentTitle() && (except == nullptr || !pane->Shows(except))) {
            captions.append(pane->GetCaption());
        }
    }
}
