#include "UReportDoc.h"

#include "CViewPane.h"
#include "MemoryLasts.h"
#include "RememberedView.h"
#include "ReportParts.h"
#include "ReportViews.h"
#include "ReportWindow.h"
#include "TextFolding.h"
#include "UView.h"

#include <algorithm>

using kareport::showsReport;

namespace
{

/// Whether a pane has the title as its caption. No pane has an empty caption.
bool isTaken(const QString &title, const QStringList &captions)
{
    if (title.isEmpty()) {
        return false;
    }
    return std::any_of(captions.begin(), captions.end(),
                       [&title](const QString &caption) { return kareport::equalFolded(title, caption); });
}

/// Whether a title begins with a name, in any case.
bool beginsWith(const QString &title, const QString &name)
{
    return kareport::equalFolded(name, QStringView(title).first(std::min(name.size(), title.size())));
}

} // namespace

QString &UReportDoc::GetTitle()
{
    return parts_->title;
}

const QString &UReportDoc::GetTitle() const
{
    return parts_->title;
}

void UReportDoc::SetTitle(const QString &title)
{
    parts_->page.losesNothing([&] {
        // It may be the very title that is numbered below. NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
        const QString given = title;
        QString &own = parts_->title;
        own = given;
        SetHeader();
        QStringList captions;
        CViewPane::GetPaneCaptions(captions, this);
        for (int number = 2; isTaken(own, captions); ++number) {
            own = given + u' ' + QString::number(number);
        }
        UDocument::SetTitle(own);
    });
}

void UReportDoc::SetWindowTextW(const QString &text)
{
    if (GetViews().empty() || !showsReport(GetViews().front())) {
        return;
    }
    if (CViewPane *pane = GetViews().front()->GetParentPane()) {
        pane->SetWindowTextW(text);
    }
}

CViewPane *UReportDoc::GetFrameWindow() const
{
    const auto view = std::find_if(GetViews().begin(), GetViews().end(), showsReport);
    return view == GetViews().end() ? nullptr : (*view)->GetParentPane();
}

void UReportDoc::Activate(bool /*reserved*/)
{
    kareport::doneWhileMemoryLasts([this] { kareport::openOwnPane(*this); });
    UpdateAllViews(nullptr, 0, nullptr);
}

void UReportDoc::SetReportWindow(kareport::ReportWindow *window)
{
    parts_->mirrors.window = window;
}

kareport::ReportWindow *UReportDoc::GetReportWindow() const
{
    return parts_->mirrors.window;
}

void UReportDoc::SetReportWindowActive()
{
    if (kareport::ReportWindow *window = GetReportWindow()) {
        kareport::doneWhileMemoryLasts([window] {
            window->setActive(true);
            window->takeFocus();
        });
    }
}

void UReportDoc::ShowReportBar(kareport::ReportWindow *window, bool show)
{
    if (window != nullptr) {
        kareport::doneWhileMemoryLasts([window, show] { window->showBar(show); });
    }
}

void UReportDoc::UpdateReportInfo(const QString &name, bool headerFlag, bool externalEditor)
{
    parts_->page.losesNothing([&] {
        if (CViewPane *pane = GetFrameWindow()) {
            kareport::showReportPane(*pane, false);
        }
        const kareport::RememberedView activeView = kareport::RememberedView::active();
        SetHeaderFlag(headerFlag);
        SetExternalEditorFlag(externalEditor);
        if (kareport::ReportWindow *window = GetReportWindow()) {
            if (!window->isCreated()) {
                window->createDocked(name, activeView.get());
            }
            window->setActive(false);
        }
        if (!name.isNull()) {
            // A run that only continues the report of this title writes no new one.
            if (!beginsWith(GetTitle(), name)) {
                WriteLine(name, 2, 2, 0);
            }
            SetTitle(name);
            SetReportFileName(name);
        }
        activeView.reactivate();
    });
}

bool UReportDoc::IsShown(const CViewPane *except) const
{
    CViewPane *window = GetReportWindow() != nullptr ? GetReportWindow()->GetOwningPane() : nullptr;
    return (window != nullptr && window->IsVisible()) || UDocument::IsShown(except);
}
