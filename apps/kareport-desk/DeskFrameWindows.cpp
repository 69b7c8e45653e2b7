#include "DeskFrame.h"

#include "COneViewPane.h"
#include "JobLauncher.h"
#include "PaneDock.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UReportWindowDlg.h"
#include "UView.h"
#include "ValueGuard.h"

#include <QApplication>
#include <QDockWidget>
#include <QLayout>

#include <algorithm>
#include <cstddef>

namespace
{

const QString layoutEntry = QStringLiteral("Window Layout");
const QString geometryEntry = QStringLiteral("Window Geometry");
/// Of what the layout holds. Those of version 0 held the panes as well.
constexpr int layoutVersion = 1;

/// The pane of the window that shows a report while it is written; null without one.
CViewPane *reportWindowPane(const UDocument &document)
{
    const auto *report = dynamic_cast<const UReportDoc *>(&document);
    return report != nullptr && report->GetReportWindow() != nullptr ? report->GetReportWindow()->GetOwningPane()
                                                                     : nullptr;
}

/// Whether a report is the rich text that was made of another one for a word processor. It has the other report's text.
bool isCopyForWordProcessor(const UReportDoc &report)
{
    return report.GetRTFDataFlag() && report.GetTitle().isEmpty() && !report.IsModified();
}

} // namespace

void DeskFrame::activate(UDocument *report)
{
    UApplication::Get()->SetCurrentReport(report);
    for (UView *view : report->GetViews()) {
        if (view->IsVisible()) {
            SetActiveViewForFrameAndPane(view);
            return;
        }
    }
    // The view of a report that is shown in a report window stays hidden.
    if (CViewPane *window = reportWindowPane(*report); window != nullptr && window->IsVisible()) {
        window->BringToTop();
    } else if (!report->GetViews().empty() && report->GetViews().front()->GetParentPane() != nullptr) {
        report->GetViews().front()->GetParentPane()->ShowPane(true);
    }
}

void DeskFrame::closeUnseen()
{
    // The code that has opened a dialog may still need the report that it is about.
    if (QApplication::activeModalWidget() != nullptr || kareport::isJobRunning()) {
        return;
    }
    for (UDocument *document : UApplication::Get()->GetDocuments()) {
        auto *report = UApplication::Get()->IsOpen(document) ? dynamic_cast<UReportDoc *>(document) : nullptr;
        // A document that must not delete itself is in the middle of being opened.
        if (report == nullptr || report->IsShown() || !report->IsAutoDelete() || editors_.holds(*report)) {
            continue;
        }
        const auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
        const bool isGivenUp = window != nullptr && window->IsGivenUp();
        const bool wasEdited = report->GetExternalEditorFlag() && !isCopyForWordProcessor(*report);
        if (isGivenUp || (!report->IsModified() && !wasEdited)) {
            report->OnCloseDocument();
        } else if (CViewPane *pane = report->GetFrameWindow()) {
            pane->ShowPane(true); // unsaved changes are not discarded: closing this pane asks again
        }
    }
}

void DeskFrame::SettlePanes()
{
    closeUnseen();
    updateStartPage();
    UXTPMDIFrameWnd::SettlePanes();
}

void DeskFrame::stepReport(int step)
{
    std::vector<UDocument *> shown = UApplication::Get()->GetDocuments();
    std::erase_if(shown, [](const UDocument *document) { return !document->IsShown(); });
    if (shown.empty()) {
        return;
    }
    const auto count = static_cast<std::ptrdiff_t>(shown.size());
    const auto current = std::find(shown.begin(), shown.end(), GetCommandDocument()) - shown.begin();
    // From none of them, it is the first or the last.
    const auto next = current == count ? (step > 0 ? 0 : count - 1) : (current + step + count) % count;
    activate(shown[static_cast<std::size_t>(next)]);
}

void DeskFrame::newWindow()
{
    UDocument *document = GetCommandDocument();
    if (document == nullptr) {
        return;
    }
    if (CViewPane *pane = GetReportTemplate()->CreateNewPane(document, nullptr, 0, nullptr)) {
        GetReportTemplate()->InitialUpdatePane(pane, document, 1);
    }
}

void DeskFrame::DockBar(COneViewPane &pane, Qt::DockWidgetArea area)
{
    UXTPMDIFrameWnd::DockBar(pane, area);
    QDockWidget *last = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(dock);
        const bool isBar = paneDock != nullptr && paneDock->pane() != nullptr && paneDock->pane() != &pane &&
                           !paneDock->pane()->CanBeTabbedDocument();
        // One that is still among the documents will leave them.
        if (isBar && !dock->isHidden() && !dock->isFloating() && !paneDock->isTabbedAgainstItsWill()) {
            last = dock;
        }
    }
    if (last != nullptr) {
        tabifyDockWidget(last, pane.GetDock());
    }
}

void DeskFrame::dockAll(const std::function<void(QDockWidget *, QDockWidget *)> &join)
{
    joinDocks(join);
    layout()->activate();
}

void DeskFrame::joinDocks(const std::function<void(QDockWidget *, QDockWidget *)> &join)
{
    // Each pane would lay all others out again: once, at the end, is enough.
    const kareport::ValueGuard quiet(layout()->isEnabled(), false, [this](bool on) { layout()->setEnabled(on); });
    QDockWidget *before = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        const auto *paneDock = dynamic_cast<kareport::PaneDock *>(dock);
        if (dock->isHidden() || paneDock == nullptr || paneDock->pane() == nullptr ||
            !paneDock->pane()->CanBeTabbedDocument()) {
            continue; // panes next to the reports keep their places
        }
        dock->setFloating(false);
        if (before == nullptr) {
            addDockWidget(Qt::TopDockWidgetArea, dock);
        } else {
            join(before, dock);
        }
        before = dock;
    }
}

void DeskFrame::arrange(Qt::Orientation orientation)
{
    dockAll(
        [this, orientation](QDockWidget *before, QDockWidget *dock) { splitDockWidget(before, dock, orientation); });
}

void DeskFrame::cascade()
{
    dockAll([this](QDockWidget *before, QDockWidget *dock) { tabifyDockWidget(before, dock); });
}

void DeskFrame::loadLayout()
{
    restoreGeometry(QByteArray::fromBase64(GetProfileString(QString(), geometryEntry).toLatin1()));
    restoreState(QByteArray::fromBase64(GetProfileString(QString(), layoutEntry).toLatin1()), layoutVersion);
}

void DeskFrame::saveLayout()
{
    // The panes go with the reports. Qt keeps places for panes that are not there at the next start, and the window of a row
    // of tabs without tabs, and fails when others are dragged into them.
    for (QDockWidget *dock : findChildren<QDockWidget *>()) {
        dock->setParent(nullptr);
        if (dynamic_cast<kareport::PaneDock *>(dock) == nullptr) {
            dock->deleteLater(); // no pane owns it
        }
    }
    for (QWidget *window : findChildren<QWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        if (window->inherits("QDockWidgetGroupWindow")) {
            delete window; // it is empty, and would be deleted a moment later
        }
    }
    WriteProfileString(QString(), geometryEntry, QString::fromLatin1(saveGeometry().toBase64()));
    WriteProfileString(QString(), layoutEntry, QString::fromLatin1(saveState(layoutVersion).toBase64()));
}
