#include "UReportDoc.h"

#include "CViewPane.h"
#include "RememberedView.h"
#include "ReportViews.h"
#include "ReportWindow.h"
#include "TextFolding.h"

void UReportDoc::SetReportWindowActive()
{
    if (reportWindow_ != nullptr) {
        reportWindow_->setActive(true);
        reportWindow_->takeFocus();
    }
}

void UReportDoc::ShowReportBar(kareport::ReportWindow *window, bool show)
{
    if (window != nullptr) {
        window->showBar(show);
    }
}

void UReportDoc::UpdateReportInfo(const QString &name, bool headerFlag, bool externalEditor)
{
    page_.losesNothing([&] { takeUp(name, headerFlag, externalEditor); });
}

void UReportDoc::takeUp(const QString &name, bool headerFlag, bool externalEditor)
{
    if (CViewPane *pane = GetFrameWindow()) {
        kareport::showReportPane(*pane, false);
    }
    const kareport::RememberedView activeView = kareport::RememberedView::active();
    SetHeaderFlag(headerFlag);
    SetExternalEditorFlag(externalEditor);
    if (reportWindow_ != nullptr) {
        if (!reportWindow_->isCreated()) {
            reportWindow_->createDocked(name, activeView.get());
        }
        reportWindow_->setActive(false);
    }
    if (!name.isNull()) {
        // A run that only continues the report of this title writes no new one.
        if (!kareport::equalFolded(name, QStringView(title_).first(qMin(name.size(), title_.size())))) {
            WriteLine(name, 2, 2, 0);
        }
        SetTitle(name);
        SetReportFileName(name);
    }
    activeView.reactivate();
}
