#include "ReportViews.h"

#include "CViewPane.h"
#include "MemoryLasts.h"
#include "ReportEntry.h"
#include "UView.h"

#include <algorithm>
#include <iterator>

namespace kareport
{

bool showsReport(const UView *view)
{
    return dynamic_cast<const ReportViewPort *>(view) != nullptr;
}

std::vector<UView *> reportViews(const UReportDoc &report)
{
    std::vector<UView *> views;
    std::copy_if(report.GetViews().begin(), report.GetViews().end(), std::back_inserter(views), showsReport);
    return views;
}

void finishLoading(const UReportDoc &report)
{
    doneWhileMemoryLasts([&report] {
        for (UView *view : reportViews(report)) {
            dynamic_cast<ReportViewPort *>(view)->finishLoading();
        }
    });
}

void openOwnPane(UReportDoc &report)
{
    if (UDocTemplate *reportTemplate = GetReportTemplate()) {
        if (CViewPane *pane = reportTemplate->CreateNewPane(&report, nullptr, UReportDoc::ownPaneStyle, nullptr)) {
            reportTemplate->InitialUpdatePane(pane, &report, 1);
            noteOwnPane(*pane, true);
        }
    }
}

void noteOwnPane(const CViewPane &pane, bool shown)
{
    for (const auto &view : pane.GetViews()) {
        if (auto *port = dynamic_cast<ReportViewPort *>(view.get())) {
            port->setPane(shown ? ReportViewPort::Pane::OwnShown : ReportViewPort::Pane::OwnHidden);
        }
    }
}

void showReportPane(CViewPane &pane, bool show)
{
    // A pane that is hidden already was hidden by other code.
    const bool isChanged = pane.IsVisible() != show;
    for (const auto &view : pane.GetViews()) {
        auto *port = dynamic_cast<ReportViewPort *>(view.get());
        if (isChanged && port != nullptr && port->pane() != ReportViewPort::Pane::OfHost) {
            port->setPane(show ? ReportViewPort::Pane::OwnShown : ReportViewPort::Pane::OwnHidden);
        }
    }
    pane.ShowPane(show);
}

void closeOwnHiddenPanes(const UReportDoc &report)
{
    for (const UView *view : reportViews(report)) {
        if (std::find(report.GetViews().begin(), report.GetViews().end(), view) == report.GetViews().end()) {
            continue; // it was closed with an earlier pane
        }
        const auto *port = dynamic_cast<const ReportViewPort *>(view);
        CViewPane *pane = view->GetParentPane();
        if (pane != nullptr && port->pane() == ReportViewPort::Pane::OwnHidden && !pane->IsVisible()) {
            pane->ClosePane();
        }
    }
}

} // namespace kareport
