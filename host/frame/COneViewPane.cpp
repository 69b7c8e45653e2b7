#include "COneViewPane.h"

#include "UView.h"
#include "UXTPMDIFrameWnd.h"

#include <QAction>
#include <QCloseEvent>
#include <QDockWidget>

/// The dock widget of a pane: its close box asks the pane.
class COneViewPane::Dock : public QDockWidget
{
public:
    explicit Dock(COneViewPane *pane) : pane_(pane) { setFocusPolicy(Qt::NoFocus); }

    void leavePane() { pane_ = nullptr; }

protected:
    void closeEvent(QCloseEvent *event) override
    {
        if (pane_ == nullptr) {
            QDockWidget::closeEvent(event);
            return;
        }
        // The pane, when it closes, takes this widget away later: it must outlive the event.
        event->ignore();
        const QPointer<Dock> self(this);
        pane_->OnSysCommand(scClose, 0);
        if (self && self->pane_ != nullptr) {
            toggleViewAction()->setChecked(true); // the pane has not closed
        }
    }

private:
    COneViewPane *pane_;
};

COneViewPane::COneViewPane() : dock_(new Dock(this))
{
    dock_->setAttribute(Qt::WA_DeleteOnClose, false);
    dock_->setObjectName(QStringLiteral("pane")); // a frame that saves its layout asks for one
}

COneViewPane::~COneViewPane()
{
    if (dock_) {
        static_cast<Dock *>(dock_.data())->leavePane();
        dock_->setWidget(nullptr);
        dock_->hide();
        dock_->deleteLater();
    }
}

void COneViewPane::AddView(std::unique_ptr<UView> view)
{
    QWidget *widget = view->GetWidget();
    CViewPane::AddView(std::move(view));
    if (widget != nullptr && dock_) {
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
        // On tabs and title bars an ampersand marks a key.
        dock_->setWindowTitle(GetCaption().replace(u'&', QStringLiteral("&&")));
        dock_->setAccessibleName(GetCaption());
    }
}

bool COneViewPane::IsVisible() const
{
    // A pane behind another tab is open all the same.
    return dock_ && !dock_->isHidden();
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
    if (dock_) {
        dock_->raise();
        if (dock_->widget() != nullptr) {
            dock_->widget()->setFocus();
        }
    }
}

void COneViewPane::OnSysCommand(unsigned command, long /*parameter*/)
{
    if (command == scClose && CanClosePane()) {
        ClosePane();
    }
}
