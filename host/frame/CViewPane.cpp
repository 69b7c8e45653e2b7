#include "CViewPane.h"

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
}

void CViewPane::AddView(std::unique_ptr<UView> view)
{
    view->pane_ = this;
    views_.push_back(std::move(view));
}

UDocument *CViewPane::GetActiveDocument() const
{
    return views_.empty() ? nullptr : views_.front()->GetDocument();
}

void CViewPane::SetWindowTextW(const QString &text)
{
    text_ = text;
    UpdateTitle();
}

QString CViewPane::GetCaption() const
{
    return windowNumber_ > 0 ? text_ + u':' + QString::number(windowNumber_) : text_;
}

void CViewPane::UpdateTitle() {}

void CViewPane::ShowPane(bool show)
{
    visible_ = show;
}

bool CViewPane::CanClosePane()
{
    UDocument *document = GetActiveDocument();
    return document == nullptr || document->CanCloseFrame(this);
}

void CViewPane::ClosePane()
{
    // The pane is no longer open while its views go: a document that closes with its last view must not find it.
    std::erase(openPanes(), this);
    views_.clear();
    delete this;
}

void CViewPane::GetPaneCaptions(QStringList &captions)
{
    captions.clear();
    for (const CViewPane *pane : openPanes()) {
        captions.append(pane->GetCaption());
    }
}
