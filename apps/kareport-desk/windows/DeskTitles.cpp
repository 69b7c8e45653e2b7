#include "DeskTitles.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "ReportResources.h"
#include "ReportWindow.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UView.h"
#include "Xlate.h"

#include <QMainWindow>

namespace kareport
{

namespace
{

void mark(const CViewPane *pane, bool unsaved)
{
    const auto *shown = dynamic_cast<const COneViewPane *>(pane);
    if (auto *dock = shown != nullptr ? dynamic_cast<PaneDock *>(shown->GetDock()) : nullptr) {
        dock->setUnsaved(unsaved);
    }
}

} // namespace

QString nameOf(const UDocument &document)
{
    // Not that of a report, which it keeps when it gets a file.
    return document.GetTitle().isEmpty() ? Xlate("Untitled") : document.GetTitle();
}

void showTitles(QMainWindow &frame, const UDocument *inFront)
{
    for (const UDocument *document : UApplication::Get()->GetDocuments()) {
        for (const UView *view : document->GetViews()) {
            mark(view->GetParentPane(), document->IsModified());
        }
        const auto *report = dynamic_cast<const UReportDoc *>(document);
        if (report != nullptr && report->GetReportWindow() != nullptr) {
            mark(report->GetReportWindow()->GetOwningPane(), document->IsModified());
        }
    }
    const QString program = Xlate(reportString(moduleTitle));
    QString name = inFront != nullptr ? nameOf(*inFront) : QString();
    name.replace(QStringLiteral("[*]"), QStringLiteral("[*][*]")); // which is the mark of changes
    frame.setWindowTitle(name.isEmpty() ? program : name + QStringLiteral("[*] — ") + program);
    frame.setWindowModified(inFront != nullptr && inFront->IsModified());
}

} // namespace kareport
