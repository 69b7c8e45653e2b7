#include "ChangedFile.h"
#include "DeskFrame.h"

#include "AppMessageBox.h"
#include "FileKind.h"
#include "Folders.h"
#include "JobLauncher.h"
#include "LandXmlContents.h"
#include "OpenTemplate.h"
#include "ReportExport.h"
#include "ReportSaveName.h"
#include "SavedReports.h"
#include "ShippedExamples.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UReportWindowDlg.h"
#include "UView.h"
#include "Xlate.h"

#include <QDir>
#include <QFileInfo>
#include <QStatusBar>

namespace
{

/// The message about a file that exists and could not be read.
QString whyNotRead(const QString &path, const kareport::ReadNotes &notes)
{
    return notes.problem.isEmpty() ? Xlate("\"%1\" could not be opened.").arg(path)
                                   : Xlate("\"%1\" could not be opened: %2").arg(path, notes.problem);
}

/// The open document of a file; null when there is none. @param except  a document to ignore
UDocument *documentOf(const QString &path, const UDocument *except = nullptr)
{
    for (UDocument *document : UApplication::Get()->GetDocuments()) {
        if (document != except && document->GetPathName() == path) {
            return document;
        }
    }
    return nullptr;
}

/// Whether a file is data that a report is made of, and no template.
bool holdsLandXml(const QString &path)
{
    const auto file = kareport::FileBytes::open(path);
    const auto *opened = std::get_if<std::shared_ptr<const kareport::FileBytes>>(&file);
    return opened != nullptr && kareport::isLandXml(*opened);
}

} // namespace

void DeskFrame::sayWhatIsNotShown(const QString &path, const kareport::ReadNotes &notes)
{
    if (!notes.warnings.isEmpty()) {
        kareport::showMessage(
            {Xlate("\"%1\" was opened, but not all of it is shown:\n\n%2").arg(path, notes.warnings.join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
}

bool DeskFrame::finishOpening(UDocument *report, const QString &error)
{
    if (!error.isEmpty()) {
        AppMessageBox(error);
    }
    if (report != nullptr) {
        activate(report);
        statusBar()->clearMessage();
    }
    return report != nullptr;
}

bool DeskFrame::OpenTemplateJob(const kareport::TemplateJob &job)
{
    return openJob(job);
}

void DeskFrame::exportValues()
{
    const kareport::ReportRecipe *found = runs_.recipeInFront();
    if (found == nullptr) {
        return;
    }
    const kareport::ReportRecipe recipe = *found; // the report may be closed while the dialog is open
    kareport::SaveRequest request;
    request.filter = kareport::exportFilter();
    request.initialFolder = GetInitialOpenDir(kareport::lastReportFolder);
    request.flags = kareport::SaveRequest::overwritePrompt | kareport::SaveRequest::pathMustExist;
    request.document = GetCommandDocument();
    request = kareport::withProposedName(request, OriginFile(request.document));
    request.document = nullptr; // it is not the report that is saved: no open file is replaced
    const auto file = askExport(request);
    if (!file) {
        return;
    }
    SetLastOpenDir(*file, kareport::lastReportFolder);
    const kareport::ExportResult result = kareport::launchExport(recipe, *file, this, askTable);
    if (!result.error.isEmpty()) {
        AppMessageBox(result.error);
    } else if (!result.warnings.isEmpty()) {
        kareport::showMessage(
            {Xlate("\"%1\" was saved, but it differs from the report:\n\n%2").arg(*file, result.warnings.join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    } else if (result.isWritten) {
        statusBar()->showMessage(Xlate("Exported to \"%1\".").arg(*file));
    }
}

void DeskFrame::giveWay(UDocument *report)
{
    auto *made = dynamic_cast<UReportDoc *>(report);
    auto *window = made != nullptr ? dynamic_cast<UReportWindowDlg *>(made->GetReportWindow()) : nullptr;
    if (window != nullptr && !keepsReportWindows_) {
        window->ShowReport();
    }
}

void DeskFrame::exportAs(kareport::OutputKind kind)
{
    auto *report = dynamic_cast<UReportDoc *>(GetCommandDocument());
    if (report == nullptr) {
        return;
    }
    const QString folder = GetInitialOpenDir(kareport::lastReportFolder);
    const auto choice =
        askExportFile(kareport::withProposedName(kareport::exportRequest(*report, kind, folder), OriginFile(report)));
    if (!choice || !UReportDoc::IsReportAvailable(report)) {
        return; // it may have been closed while the dialog was open
    }
    SetLastOpenDir(choice->path, kareport::lastReportFolder);
    QStringList warnings;
    const QString problem = kareport::exportReport(*report, *choice, warnings);
    if (!problem.isEmpty()) {
        kareport::sayNotSaved(choice->path, problem);
    } else if (!warnings.isEmpty()) {
        kareport::showMessage(
            {Xlate("\"%1\" was saved, but it differs from the report:\n\n%2").arg(choice->path, warnings.join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    } else {
        statusBar()->showMessage(Xlate("Exported to \"%1\".").arg(choice->path));
    }
}

bool DeskFrame::OpenFile(const QString &path)
{
    if (const QString reason = kareport::whyNotOpened(path); !reason.isEmpty()) {
        kareport::showMessage(
            {reason, QFileInfo(path).fileName(), MessageButtons::Ok, kareport::MessageIcon::Information});
        return false;
    }
    const auto kind = kareport::fileKindOf(path);
    if (kind == kareport::FileKind::Template) {
        if (!holdsLandXml(path)) {
            return kareport::openTemplateAt(path);
        }
        fromTemplate(path);
        return true;
    }
    if (kind == kareport::FileKind::Job) {
        return openJob(path);
    }
    const QString file = QDir::cleanPath(QFileInfo(path).absoluteFilePath());
    if (reading_.contains(file)) {
        return true;
    }
    kareport::ReadNotes notes;
    UDocument *report = openReport(file, notes);
    const QString error = report == nullptr && !notes.isStopped ? whyNotRead(path, notes) : QString();
    const bool isOpened = finishOpening(report, error);
    sayWhatIsNotShown(path, notes);
    return isOpened;
}

bool DeskFrame::openJob(const kareport::ReportRecipe &recipe)
{
    QString error;
    UReportDoc *report = runs_.run(recipe, error);
    giveWay(report);
    const bool isMade = finishOpening(report, error);
    if (isMade && !recipe.jobFile().isEmpty() && !kareport::isShippedExample(recipe.jobFile())) {
        UApplication::Get()->AddToRecentFileList(recipe.jobFile());
    }
    runs_.showFront();
    return isMade;
}

UDocument *DeskFrame::openReport(const QString &file, kareport::ReadNotes &notes)
{
    if (UDocument *open = documentOf(file)) {
        return open;
    }
    UReportDoc *report = read(file, [&] { return kareport::openSavedReport(file, &notes); });
    UDocument *other = documentOf(file, report);
    if (report != nullptr && other != nullptr) {
        // Another report was saved into the file while it was read: they would overwrite each other.
        report->OnCloseDocument();
        return other;
    }
    return report;
}

UReportDoc *DeskFrame::read(const QString &file, const std::function<UReportDoc *()> &open)
{
    reading_.append(file);
    files_.expect(file);
    UReportDoc *report = open();
    reading_.removeOne(file);
    if (report == nullptr) {
        files_.ceaseToExpect(file);
    }
    return report;
}

void DeskFrame::NoteDocumentEvent(UDocument &document, UDocument::DocumentEvent event)
{
    if (event == UDocument::DocumentEvent::AfterCloseDocument) {
        recovery_.forget(dynamic_cast<const UReportDoc *>(&document));
        editors_.forget(dynamic_cast<const UReportDoc *>(&document));
        runs_.forget(&document);
    }
    // A document that has just been opened or saved under a new name gets its path after the event.
    QMetaObject::invokeMethod(
        this,
        [this, event, &document] {
            QStringList paths;
            for (const UDocument *open : UApplication::Get()->GetDocuments()) {
                paths.append(open->GetPathName());
            }
            files_.retain(paths);
            if (event == UDocument::DocumentEvent::AfterCloseDocument || !UApplication::Get()->IsOpen(&document)) {
                return;
            }
            const QString path = document.GetPathName();
            // Only a file that was saved here is known to be unchanged: a file that was read may have changed since.
            const bool isNew = event == UDocument::DocumentEvent::AfterSaveDocument || !files_.isWatched(path);
            if (isNew && !path.isEmpty() && !kareport::isPdfName(path)) {
                files_.watch(path);
            }
        },
        Qt::QueuedConnection);
}

void DeskFrame::loadAgain(UReportDoc &report)
{
    const QString path = report.GetPathName();
    kareport::ReadNotes notes;
    const bool isLoaded = kareport::reloadSavedReport(report, &notes);
    if (isLoaded) {
        sayWhatIsNotShown(path, notes);
        return;
    }
    if (UReportDoc::IsReportAvailable(&report)) {
        report.SetModifiedFlag(true); // what is shown is not in any file any more
        if (!notes.isStopped) {
            const QString reason = kareport::whyNotOpened(path);
            AppMessageBox(reason.isEmpty() ? whyNotRead(path, notes) : reason);
        }
    }
}

void DeskFrame::fileChanged(const QString &path)
{
    for (UDocument *open : UApplication::Get()->GetDocuments()) {
        auto *document = dynamic_cast<UReportDoc *>(open);
        if (document == nullptr || document->GetPathName() != path) {
            continue;
        }
        if (kareport::askToLoadAgain(path, document->IsModified()) && UApplication::Get()->IsOpen(document)) {
            loadAgain(*document);
        }
        return;
    }
}
