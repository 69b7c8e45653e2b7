#include "DeskFrame.h"

#include "AppMessageBox.h"
#include "DeskSheets.h"
#include "Folders.h"
#include "JobLauncher.h"
#include "OpenTemplate.h"
#include "PreferencesDialog.h"
#include "ReportEntry.h"
#include "ReportResources.h"
#include "ReportSaveName.h"
#include "SaveAs.h"
#include "TemplateDialog.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QCloseEvent>
#include <QDragEnterEvent>
#include <QFileDialog>
#include <QMimeData>
#include <QStatusBar>
#include <QTimer>

DeskFrame::DeskFrame() : files_([this](const QString &path) { fileChanged(path); })
{
    commands_ = makeCommands();
    kareport::setFileOpener([this](const QString &path) { return OpenFile(path); });
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
    askExport = [this](const kareport::SaveRequest &request) -> std::optional<QString> {
        const std::optional<kareport::SaveChoice> choice = kareport::askSavePath(this, request);
        return choice ? std::optional(choice->path) : std::nullopt;
    };
    askTemplate = [this](const QString &templateFile) -> std::optional<kareport::TemplateJob> {
        kareport::TemplateDialog dialog(this);
        if (!templateFile.isEmpty()) {
            dialog.setFile(templateFile);
        }
        return dialog.exec() == QDialog::Accepted ? std::optional(dialog.job()) : std::nullopt;
    };
    loadLayout();
    UpdateCommands();
    constexpr int unseenInterval = 500; // milliseconds
    auto *unseenTimer = new QTimer(this);
    unseenTimer->setObjectName(unseenTimerName);
    connect(unseenTimer, &QTimer::timeout, this, [this] { closeUnseen(); });
    unseenTimer->start(unseenInterval);
    constexpr int recoveryInterval = 5000; // milliseconds
    auto *recoveryTimer = new QTimer(this);
    connect(recoveryTimer, &QTimer::timeout, this, [this] { recovery_.keep(); });
    recoveryTimer->start(recoveryInterval);
}

DeskFrame::~DeskFrame()
{
    kareport::dropTemplateEditors();
    kareport::setFileOpener({});
}

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
        const kareport::DeskPreferences before = kareport::loadPreferences();
        kareport::savePreferences(dialog.preferences());
        if (dialog.preferences().paper != before.paper) {
            kareport::usePaper(dialog.preferences()); // else that of the page set-up stays
            kareport::restartAllSheets();
        }
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
    if (!kareport::closeTemplateEditors()) {
        event->ignore();
        kareport::noteExitCancelled();
        return;
    }
    // What is being read is cancelled first: code that waits for it must not find the reports deleted.
    if (kareport::stopWorkAside(this, [this] { close(); })) {
        event->ignore();
        kareport::noteExitCancelled();
        return;
    }
    const UApplication &application = *UApplication::Get();
    for (UDocument *document : application.GetDocuments()) {
        if (application.IsOpen(document) && !document->SaveModified() && application.IsOpen(document)) {
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
