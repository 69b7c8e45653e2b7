#include "ReportWindowBody.h"

#include "CReportToolBar.h"
#include "ReportResources.h"
#include "UReportList.h"
#include "UReportWindowDlg.h"

#include <QResizeEvent>

#include <algorithm>

namespace kareport
{

namespace
{

/// How often the buttons follow the state of the report.
constexpr int updateInterval = 200; // milliseconds

} // namespace

ReportWindowBody::ReportWindowBody(UReportWindowDlg *window)
    : window_(window), toolBar_(new CReportToolBar(window, this)), list_(new UReportList(this))
{
    const DialogResource dialog = reportDialog(reportWindowDialog);
    setFont(dialog.font());
    list_->Create(this, pixelsOfDialogUnits(dialog.controlPlace, fontMetrics()), static_cast<int>(dialog.control));
    // The window sees all keys first, whichever widget in it has the keyboard.
    list_->installEventFilter(this);
    toolBar_->installEventFilter(this);
    for (QAction *button : toolBar_->actions()) {
        toolBar_->widgetForAction(button)->installEventFilter(this);
    }
    setFocusProxy(list_);
    connect(&updateTimer_, &QTimer::timeout, this, &ReportWindowBody::updateCommands);
    updateTimer_.setInterval(updateInterval);
}

void ReportWindowBody::leaveWindow()
{
    window_ = nullptr;
    updateTimer_.stop();
    toolBar_->setEnabled(false); // its buttons act on the window
}

void ReportWindowBody::arrange(int width, int height)
{
    const int bar = toolBar_->sizeHint().height();
    toolBar_->setGeometry(0, 0, width, bar);
    list_->setGeometry(0, bar, width, std::max(0, height - bar));
}

void ReportWindowBody::updateCommands()
{
    if (window_ != nullptr) {
        toolBar_->OnUpdateCmdUI(nullptr, true);
    }
}

QSize ReportWindowBody::sizeHint() const
{
    return pixelsOfDialogUnits(QRect(QPoint(), reportDialog(reportWindowDialog).size), fontMetrics()).size();
}

bool ReportWindowBody::eventFilter(QObject *watched, QEvent *event)
{
    return (window_ != nullptr && window_->PreTranslateMessage(event)) || QWidget::eventFilter(watched, event);
}

void ReportWindowBody::resizeEvent(QResizeEvent *event)
{
    QWidget::resizeEvent(event);
    if (window_ != nullptr) {
        window_->OnSize(0, event->size().width(), event->size().height());
    }
}

void ReportWindowBody::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        arrange(width(), height());
    }
}

void ReportWindowBody::showEvent(QShowEvent *event)
{
    updateCommands();
    updateTimer_.start();
    QWidget::showEvent(event);
}

void ReportWindowBody::hideEvent(QHideEvent *event)
{
    updateTimer_.stop();
    QWidget::hideEvent(event);
}

} // namespace kareport
