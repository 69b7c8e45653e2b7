#include "UView.h"

#include "CViewPane.h"
#include "UDocument.h"

UView::UView() = default;

UView::~UView()
{
    if (document_ != nullptr) {
        document_->RemoveView(this);
    }
}

void UView::OnInitialUpdate()
{
    OnUpdate(nullptr, 0, nullptr);
}

void UView::OnUpdate(UView * /*sender*/, long /*hint*/, void * /*hintObject*/) {}

bool UView::IsVisible() const
{
    return pane_ != nullptr && pane_->IsVisible();
}
