#include "UView.h"

#include "CViewPane.h"
#include "UApplication.h"
#include "UDocument.h"
#include "UXTPMDIFrameWnd.h"

#include <QWidget>

UView::UView() : handle_(std::make_shared<UView *>(this)) {}

UView::~UView()
{
    *handle_ = nullptr;
    if (UXTPMDIFrameWnd::Get() != nullptr) {
        UXTPMDIFrameWnd::Get()->ResetActiveViewForFrameAndPane(this);
    }
    if (UApplication::Get() != nullptr) {
        UApplication::Get()->ForgetView(this);
    }
    if (document_ != nullptr) {
        document_->RemoveView(this);
    }
}

void UView::OnInitialUpdate()
{
    OnUpdate(nullptr, 0, nullptr);
}

void UView::OnUpdate(UView * /*sender*/, long /*hint*/, void * /*hintObject*/) {}

void UView::OnActivateView(bool activate, UView *activated, UView * /*deactivated*/)
{
    QWidget *widget = GetWidget();
    if (!activate || activated != this || widget == nullptr) {
        return;
    }
    const QWidget *focus = widget->window()->focusWidget();
    if (focus == nullptr || (focus != widget && !widget->isAncestorOf(focus))) {
        widget->setFocus(Qt::OtherFocusReason);
    }
}

bool UView::IsVisible() const
{
    return pane_ != nullptr && pane_->IsVisible();
}
