#include "UReportWindowDlg.h"

#include "CReportToolBar.h"
#include "PageDefaults.h"
#include "RememberedView.h"
#include "ReportContent.h"
#include "ReportResources.h"
#include "ReportWindowBody.h"
#include "ReportWindowCommands.h"
#include "UReportDoc.h"
#include "UReportList.h"
#include "UView.h"
#include "UXTPMDIFrameWnd.h"
#include "XInput.h"
#include "Xlate.h"

#include <QKeyEvent>

#include <algorithm>

namespace
{

/// Saved under this name with the frame's layout.
const QString dockName = QStringLiteral("reportWindow");

/// Gives a dock widget the height that it asks for, and the documents above it the rest: a frame that shows nothing between
/// them would share its height out evenly.
void fitHeight(UXTPMDIFrameWnd &frame, QDockWidget &dock)
{
    const int height = dock.sizeHint().height();
    QList<QDockWidget *> docks{&dock};
    QList<int> heights{height};
    for (QDockWidget *other : frame.findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        if (other != &dock && !other->isFloating() && frame.dockWidgetArea(other) == Qt::TopDockWidgetArea) {
            docks += other;
            heights += std::max(height, frame.height() - height);
        }
    }
    frame.resizeDocks(docks, heights, Qt::Vertical);
}

} // namespace

UReportWindowDlg::UReportWindowDlg()
    : commands_{
          {kareport::commandShowReport, [this] { OnShowReport(); },
           [this](kareport::CommandState &state) { OnUpdateShowReport(state); }},
          {kareport::commandSaveReport, [this] { OnSave(); },
           [this](kareport::CommandState &state) { OnUpdateSave(state); }},
          {kareport::commandPrintReport, [this] { OnPrint(); },
           [this](kareport::CommandState &state) { OnUpdatePrint(state); }},
      },
      menuCommands_(std::make_unique<kareport::ReportWindowCommands>(*this)),
      previousView_(std::make_unique<kareport::RememberedView>())
{}

UReportWindowDlg::~UReportWindowDlg()
{
    UReportWindowDlg::ClosePane();
    UReportDoc *report = GetReportDoc();
    if (report != nullptr && report->GetReportWindow() == this) {
        report->SetReportWindow(nullptr);
    }
}

bool UReportWindowDlg::Create(const QString &title, UView *previousView)
{
    return createAt(Qt::LeftDockWidgetArea, title, previousView);
}

bool UReportWindowDlg::createDocked(const QString &caption, UView *previousView)
{
    return createAt(Qt::BottomDockWidgetArea, caption, previousView);
}

bool UReportWindowDlg::createAt(Qt::DockWidgetArea area, const QString &title, UView *previousView)
{
    UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get();
    if (frame == nullptr || isCreated()) {
        return isCreated();
    }
    MakeDock();
    body_ = new kareport::ReportWindowBody(this);
    *previousView_ = kareport::RememberedView(previousView);
    HandleInitDialog();
    SetReportDoc(report_);

    QDockWidget *dock = GetDock();
    dock->setObjectName(dockName);
    dock->setAllowedAreas(Qt::AllDockWidgetAreas);
    dock->setWidget(body_);
    dock->setFocusProxy(body_);
    SetWindowTextW(title);
    frame->DockBar(*this, area);
    ShowPane(true);
    fitHeight(*frame, *dock);
    return true;
}

long UReportWindowDlg::HandleInitDialog()
{
    givenUp_.reset();
    if (body_) {
        body_->list().setAccessibleName(Xlate("Report lines"));
    }
    setActive(false);
    return 0;
}

void UReportWindowDlg::OnSize(unsigned /*type*/, int cx, int cy)
{
    if (body_) {
        body_->arrange(cx, cy);
    }
}

void UReportWindowDlg::showBar(bool show)
{
    if (isCreated()) {
        ShowPane(show);
    }
}

void UReportWindowDlg::ClosePane()
{
    if (body_) {
        body_->leaveWindow();
        body_.clear();
        DropDock();
    }
}

void UReportWindowDlg::OnSysCommand(unsigned command, long parameter)
{
    if (command == scClose) {
        OnPressCloseButton();
    } else {
        CPropertyPane::OnSysCommand(command, parameter);
    }
}

UDocument *UReportWindowDlg::GetShownDocument() const
{
    return GetReportDoc();
}

kareport::CommandTarget *UReportWindowDlg::GetCommandTarget()
{
    return menuCommands_.get();
}

bool UReportWindowDlg::PreTranslateMessage(QEvent *event)
{
    const bool isKey = event->type() == QEvent::KeyPress || event->type() == QEvent::KeyRelease;
    const bool isAsked = event->type() == QEvent::ShortcutOverride; // whether the key is to come as a key at all
    if ((!isKey && !isAsked) || static_cast<QKeyEvent *>(event)->key() != Qt::Key_Escape) {
        return false;
    }
    const UView *view = GetPreviousView();
    if (view == nullptr || view->Top() == nullptr) {
        return false;
    }
    event->accept();
    if (isKey) {
        view->Top()->Terminate(XInput::givenUp);
    }
    return true;
}

CReportToolBar *UReportWindowDlg::GetToolBar() const
{
    return body_ ? &body_->toolBar() : nullptr;
}

void UReportWindowDlg::setActive(bool active)
{
    active_ = active;
    updateCommands();
}

void UReportWindowDlg::updateCommands()
{
    if (body_) {
        body_->updateCommands();
    }
}

void UReportWindowDlg::takeFocus()
{
    if (body_) {
        BringToTop();
    }
}

UView *UReportWindowDlg::GetPreviousView() const
{
    return previousView_->get();
}

void UReportWindowDlg::ActivatePreviousView()
{
    previousView_->bringToTop();
}
