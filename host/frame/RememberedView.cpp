#include "RememberedView.h"

#include "CViewPane.h"
#include "UView.h"
#include "UXTPMDIFrameWnd.h"

namespace kareport
{

RememberedView::RememberedView(const UView *view) : handle_(view != nullptr ? view->GetHandle() : nullptr) {}

RememberedView RememberedView::active()
{
    const UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get();
    return RememberedView(frame != nullptr ? frame->GetActiveView() : nullptr);
}

bool RememberedView::bringToTop() const
{
    if (get() == nullptr || get()->GetParentPane() == nullptr || !get()->GetParentPane()->IsVisible()) {
        return false;
    }
    get()->GetParentPane()->BringToTop();
    return true;
}

void RememberedView::reactivate() const
{
    if (bringToTop() && UXTPMDIFrameWnd::Get() != nullptr) {
        UXTPMDIFrameWnd::Get()->SetActiveViewForFrameAndPane(get());
    }
}

} // namespace kareport
