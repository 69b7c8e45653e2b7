#include "DeskFrame.h"

#include "AppMessageBox.h"
#include "Folders.h"
#include "JobLauncher.h"
#include "PreferencesDialog.h"
#include "ReportEntry.h"
#include "ReportResources.h"
#include "ReportSaveName.h"
#include "SavedReports.h"
#include "SavedText.h"
#include "TemplateDialog.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UView.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QCloseEvent>
#include <QDir>
#include <QDragEnterEvent>
#include <QFileDialog>
#include <QFileInfo>
#include <QMimeData>
#include <QStatusBar>
#include <QTimer>

#include <utility>

namespace
{

std::vector<UDocument *> openDocuments()
{
    return UApplication::Get()->GetDocuments();
}

bool isOpen(const UDocument *document)
{
    return UApplication::Get()->IsOpen(document);
}

/// Says what a file holds that its report does not show.
void sayWhatIsNotShown(const QString &path, const kareport::ReadNotes &notes)
{
    if (!notes.warnings.isEmpty()) {
        kareport::showMessage(
            {Xlate("\"%1\" was opened, but not all of it is shown:\n\n%2").arg(path, notes.warnings.join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
}

/// Says how many notes there are on a report that was made, and the first of them.
void sayNotes(const kareport::JobNotes &notes)
{
    constexpr qsizetype mostShown = 20;
    QStringList lines;
    const std::vector<kareport::JobNote> said = notes.said();
    for (const kareport::JobNote &note : said) {
        if (lines.size() == mostShown) {
            lines.append(QStringLiteral("…"));
            break;
        }
        lines.append(note.message());
    }
    if (!lines.isEmpty()) {
        kareport::showMessage({Xlate("The report was made. Notes on its data: %1\n\n%2")
                                   .arg(QString::number(said.size()), lines.join(u'\n')),
                               QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
}

/// What is said of a file that is there and could not be read.
QString whyNotRead(const QString &path, const kareport::ReadNotes &notes)
{
    return notes.problem.isEmpty() ? Xlate("\"%1\" could not be opened.").arg(path)
                                   : Xlate("\"%1\" could not be opened: %2").arg(path, notes.problem);
}

/// What is said of a report that could not be opened again.
QString lineOf(const kareport::KeptReport &kept, const kareport::ReadNotes &notes)
{
    const QString missing = kept.textFile.isEmpty() ? kareport::whyNotOpened(kept.path) : QString();
    const QString reason = missing.isEmpty() ? notes.problem : missing;
    return reason.isEmpty() ? kept.name() : kept.name() + QStringLiteral(": ") + reason;
}

/// The open document of a file; null when there is none. @param except  which is not meant
UDocument *documentOf(const QString &path, const UDocument *except = nullptr)
{
    for (UDocument *document : openDocuments()) {
        if (document != except && document->GetPathName() == path) {
            return document;
        }
    }
    return nullptr;
}

} // namespace

DeskFrame::DeskFrame() : files_([this](const QString &path) { fileChanged(path); })
{
    commands_ = makeCommands();
    setWindowTitle(Xlate(kareport::reportString(kareport::moduleTitle)));
    setAcceptDrops(true);
    constexpr QSize usualSize(1000, 760);
    resize(usualSize);
    makeMenus();
    statusBar()->showMessage(Xlate("Open a job or a saved report, or drop it here."));
    askFile = [this]() -> std::optional<QString> {
        const QString path =
            QFileDialog::getOpenFileName(this, Xlate("Open"), GetInitialOpenDir(kareport::lastReportFolder),
                                         Xlate("Reports, jobs and templates (*.rep *.rtf *.json *.xml)") +
                                             QStringLiteral(";;") + Xlate("All files (*)"));
        return path.isEmpty() ? std::nullopt : std::optional(path);
    };
    askTemplate = [this](const QString &templateFile) -> std::optional<kareport::TemplateJob> {
        kareport::TemplateDialog dialog(this);
        if (!templateFile.isEmpty()) {
            dialog.setTemplateFile(templateFile);
        }
        return dialog.exec() == QDialog::Accepted ? std::optional(dialog.job()) : std::nullopt;
    };
    loadLayout();
    UpdateCommands();
    constexpr int unseenInterval = 500; // milliseconds
    auto *unseenTimer = new QTimer(this);
    connect(unseenTimer, &QTimer::timeout, this, [this] { closeUnseen(); });
    unseenTimer->start(unseenInterval);
    constexpr int recoveryInterval = 5000; // milliseconds
    auto *recoveryTimer = new QTimer(this);
    connect(recoveryTimer, &QTimer::timeout, this, [this] { recovery_.keep(); });
    recoveryTimer->start(recoveryInterval);
}

DeskFrame::~DeskFrame() = default;

void DeskFrame::newReport()
{
    if (UReportDoc *report = CreateReport(Xlate("Report"), true, false, nullptr, 0, nullptr)) {
        activate(report);
    }
}

void DeskFrame::open()
{
    if (const auto path = askFile()) {
        SetLastOpenDir(*path, kareport::lastReportFolder);
        OpenFile(*path);
    }
}

void DeskFrame::fromTemplate(const QString &templateFile)
{
    if (const auto job = askTemplate(templateFile)) {
        OpenTemplateJob(*job);
    }
}

void DeskFrame::askPreferences()
{
    kareport::PreferencesDialog dialog(kareport::loadPreferences(), this);
    if (dialog.exec() == QDialog::Accepted) {
        kareport::savePreferences(dialog.preferences());
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
    QString error;
    kareport::JobNotes notes;
    UDocument *report = kareport::launchTemplateJob(job, this, error, notes);
    const bool isMade = finishOpening(report, error);
    if (isMade) {
        sayNotes(notes);
    }
    return isMade;
}

bool DeskFrame::OpenFile(const QString &path)
{
    if (const QString reason = kareport::whyNotOpened(path); !reason.isEmpty()) {
        kareport::showMessage(
            {reason, QFileInfo(path).fileName(), MessageButtons::Ok, kareport::MessageIcon::Information});
        return false;
    }
    if (path.endsWith(u".xml", Qt::CaseInsensitive)) {
        fromTemplate(path);
        return true;
    }
    if (path.endsWith(u".json", Qt::CaseInsensitive)) {
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

bool DeskFrame::openJob(const QString &path)
{
    QString error;
    kareport::JobNotes notes;
    UDocument *report = kareport::launchJob(path, this, error, notes);
    const bool isMade = finishOpening(report, error);
    if (isMade) {
        UApplication::Get()->AddToRecentFileList(path);
        sayNotes(notes);
    }
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
        report
            ->OnCloseDocument(); // another report was saved into the file while it was read: they would overwrite each other
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

std::vector<kareport::KeptReport> DeskFrame::reopen(const std::vector<kareport::KeptReport> &left)
{
    std::vector<kareport::KeptReport> notReopened;
    QStringList lost;
    bool isTextKept = false;
    kareport::ReadNotes notes;
    for (const kareport::KeptReport &kept : left) {
        const auto open = [&] { return kareport::Recovery::reopen(kept, &notes); };
        notes.problem.clear();
        UReportDoc *report = notes.isStopped ? nullptr : read(kept.path, open);
        if (report != nullptr) {
            activate(report);
            sayWhatIsNotShown(kept.path, std::exchange(notes, {}));
            continue;
        }
        notReopened.push_back(kept);
        if (!notes.isStopped) {
            lost.append(lineOf(kept, notes));
            isTextKept = isTextKept || kareport::Recovery::holdsText(kept);
        }
    }
    if (!lost.isEmpty()) {
        QString text = Xlate("These reports could not be opened again:\n\n%1").arg(lost.join(u'\n'));
        if (isTextKept) {
            text += QStringLiteral("\n\n") +
                    Xlate("Their changes that were not saved are kept, and are offered again at the next start.");
        }
        kareport::showMessage({text, QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
    return notReopened;
}

void DeskFrame::OfferLeftReports()
{
    const std::vector<kareport::KeptReport> left = recovery_.leftReports();
    if (!recovery_.unreadableFolders().isEmpty()) {
        kareport::showMessage(
            {Xlate("KaReport did not end properly, and what it had open cannot be read. These folders "
                   "are left as they are:\n\n%1")
                 .arg(recovery_.unreadableFolders().join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
    QStringList names;
    for (const kareport::KeptReport &kept : left) {
        names.append(kept.name() +
                     (kept.textFile.isEmpty() ? QString() : Xlate(" (with changes that were not saved)")));
    }
    std::vector<kareport::KeptReport> notReopened;
    if (!left.empty()) {
        const MessageAnswer answer = kareport::showMessage(
            {Xlate("KaReport did not end properly the last time. These reports were open:\n\n%1\n\nOpen them again?")
                 .arg(names.join(u'\n')),
             QString(), MessageButtons::YesNoCancel, kareport::MessageIcon::Question});
        if (answer == MessageAnswer::Cancel) {
            return; // they are offered again at the next start
        }
        if (answer == MessageAnswer::Yes) {
            notReopened = reopen(left);
        }
        if (!recovery_.keep()) {
            return; // a full disk: what was left stays where it is
        }
    }
    recovery_.discardLeft(notReopened);
}

void DeskFrame::NoteDocumentEvent(UDocument &document, UDocument::DocumentEvent event)
{
    if (event == UDocument::DocumentEvent::AfterCloseDocument) {
        recovery_.forget(dynamic_cast<const UReportDoc *>(&document));
        editors_.forget(dynamic_cast<const UReportDoc *>(&document));
    }
    // A document that has just been opened or saved under a new name gets its path after the event.
    QMetaObject::invokeMethod(
        this,
        [this, event, &document] {
            QStringList paths;
            for (const UDocument *open : openDocuments()) {
                paths.append(open->GetPathName());
            }
            files_.retain(paths);
            if (event == UDocument::DocumentEvent::AfterCloseDocument || !isOpen(&document)) {
                return;
            }
            const QString path = document.GetPathName();
            // Only what is saved here is as it was left: a file that was read may have changed since.
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
        report.SetModifiedFlag(true); // what is shown stands in no file any more
        if (!notes.isStopped) {
            const QString reason = kareport::whyNotOpened(path);
            AppMessageBox(reason.isEmpty() ? whyNotRead(path, notes) : reason);
        }
    }
}

void DeskFrame::fileChanged(const QString &path)
{
    for (UDocument *open : openDocuments()) {
        auto *document = dynamic_cast<UReportDoc *>(open);
        if (document == nullptr || document->GetPathName() != path) {
            continue;
        }
        const QString question =
            document->IsModified()
                ? Xlate("\"%1\" was changed by another program, and it has changes here that are not saved. "
                        "Load it again and lose the changes made here?")
                : Xlate("\"%1\" was changed by another program. Load it again?");
        const MessageAnswer answer = kareport::showMessage(
            {question.arg(path), QString(), MessageButtons::YesNo, kareport::MessageIcon::Question});
        if (answer == MessageAnswer::Yes && isOpen(document)) {
            loadAgain(*document);
        }
        return;
    }
}

void DeskFrame::about()
{
    kareport::showMessage(
        {Xlate("KaReport: fixed-pitch reports for civil engineering and surveying.\n\n"
               "Open a job (.json) to run it, or a saved report (.rep, .rtf) to read, edit and print it. "
               "Ctrl+F finds text, Ctrl+G goes to a page, Ctrl+wheel zooms."),
         Xlate("About KaReport"), MessageButtons::Ok, kareport::MessageIcon::Information});
}

void DeskFrame::closeEvent(QCloseEvent *event)
{
    if (kareport::isJobRunning()) {
        event->ignore();
        kareport::noteExitCancelled();
        return;
    }
    // What is being read is given up first: whoever waits for it must not find the reports gone.
    if (kareport::stopWorkAside(this, [this] { close(); })) {
        event->ignore();
        kareport::noteExitCancelled();
        return;
    }
    for (UDocument *document : openDocuments()) {
        if (isOpen(document) && !document->SaveModified() && isOpen(document)) {
            event->ignore();
            kareport::noteExitCancelled();
            return;
        }
    }
    UApplication::Get()->CloseAllDocuments();
    saveLayout();
    event->accept();
}

void DeskFrame::dragEnterEvent(QDragEnterEvent *event)
{
    if (event->mimeData()->hasUrls()) {
        event->acceptProposedAction();
    }
}

void DeskFrame::dropEvent(QDropEvent *event)
{
    event->acceptProposedAction();
    for (const QUrl &url : event->mimeData()->urls()) {
        if (url.isLocalFile()) {
            OpenFile(url.toLocalFile());
        }
    }
}
