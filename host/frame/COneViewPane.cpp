#include "COneViewPane.h"

#include "PaneDock.h"
#include "UDocument.h"
#include "UView.h"
#include "UXTPMDIFrameWnd.h"

COneViewPane::COneViewPane()
{
    MakeDock();
}

COneViewPane::~COneViewPane()
{
    DropDock();
}

void COneViewPane::MakeDock()
{
    if (!dock_) {
        dock_ = new kareport::PaneDock(this);
    }
}

void COneViewPane::DropDock()
{
    if (dock_) {
        dock_->leavePane();
        dock_->setWidget(nullptr);
        dock_->hide();
        dock_->deleteLater();
        dock_.clear();
    }
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
        frame->ForgetPane(*this);
    }
}

QDockWidget *COneViewPane::GetDock() const
{
    return dock_;
}

void COneViewPane::AddView(std::unique_ptr<UView> view)
{
    const UView *added = view.get();
    QWidget *widget = view->GetWidget();
    CViewPane::AddView(std::move(view));
    if (GetActiveView() == added && widget != nullptr && dock_) {
        dock_->setWidget(widget);
        dock_->setFocusProxy(widget);
    }
}

void COneViewPane::SetPlace(CViewPane *parent, unsigned style, const QRect *rect)
{
    CViewPane::SetPlace(parent, style, rect);
    dock_->hide();
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
        frame->DockPane(*this);
        dock_->hide();
    }
    if (rect != nullptr) {
        dock_->setFloating(true);
        dock_->setGeometry(*rect);
    }
}

void COneViewPane::UpdateTitle()
{
    if (dock_) {
        dock_->setCaption(GetCaption());
    }
}

bool COneViewPane::IsVisible() const
{
    // A pane behind another tab is still open.
    return dock_ && !dock_->isHidden();
}

bool COneViewPane::IsInFront() const
{
    return IsVisible() && !dock_->isBehindTab();
}

void COneViewPane::ShowPane(bool show)
{
    if (dock_) {
        dock_->setVisible(show);
        if (show) {
            BringToTop();
        }
    }
}

void COneViewPane::BringToTop()
{
    if (!IsVisible()) {
        return;
    }
    dock_->comeToFront();
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
        frame->ActivatePane(*this);
    } else if (dock_->widget() != nullptr) {
        dock_->widget()->setFocus();
    }
}

void COneViewPane::DockShown(bool shown)
{
    CountAgain();
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get(); frame != nullptr && !shown) {
        frame->LeavePane(*this);
    }
}

void COneViewPane::SetCaptionState(CaptionState state)
{
    if (dock_) {
        dock_->setMarked(state == captionHighlighted);
    }
}

COneViewPane::CaptionState COneViewPane::GetCaptionState() const
{
    return dock_ && dock_->isMarked() ? captionHighlighted : captionPlain;
}

void COneViewPane::OnSysCommand(unsigned command, long /*parameter*/)
{
    // The user is asked meanwhile, and whatever happens then may close the pane.
    if (command != scClose || !CanClosePane() || !IsOpen(this)) {
        return;
    }
    UDocument *document = GetActiveDocument();
    if (document != nullptr && document->GetViews().size() > 1 && !document->IsShown(this)) {
        document->OnCloseDocument(); // its other panes are hidden: it could never be closed
    } else {
        ClosePane();
    }
}
