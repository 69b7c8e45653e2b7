#include "DeskFrame.h"

#include "AboutDialog.h"
#include "CommandList.h"
#include "CommandTips.h"
#include "DeskPreferences.h"
#include "DeskSheets.h"
#include "FileDrops.h"
#include "FileKind.h"
#include "Folders.h"
#include "GuidePages.h"
#include "HelpWindow.h"
#include "JobLauncher.h"
#include "OpenTemplate.h"
#include "PreferencesDialog.h"
#include "ProgramIcon.h"
#include "ReportEntry.h"
#include "ReportSaveName.h"
#include "SaveAs.h"
#include "ScreenFit.h"
#include "Session.h"
#include "StartPage.h"
#include "TabClosing.h"
#include "TemplateDialog.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "WindowList.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QApplication>
#include <QCloseEvent>
#include <QFileDialog>
#include <QMenuBar>
#include <QTimer>

DeskFrame::DeskFrame() : files_([this](const QString &path) { fileChanged(path); })
{
    commands_ = makeCommands();
    kareport::setFileOpener([this](const QString &path) { return OpenFile(path); });
    keepsReportWindows_ = kareport::loadPreferences().keepsReportWindows;
    setWindowIcon(kareport::programIcon());
    new kareport::FileDrops(*this, [this](const QStringList &files) { openDropped(files); });
    new kareport::TabClosing(*this);
    new kareport::HelpKey(*this);
    new kareport::CommandTips(*this, [this] { UpdateCommands(); });
    new kareport::ScreenFit(*this);
    constexpr QSize usualSize(1000, 760);
    resize(kareport::fittingSize(*this, usualSize));
    makeMenus();
    makeStartPage();
    askNames();
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

void DeskFrame::askNames()
{
    askFile = [this]() -> std::optional<QString> {
        const QString path =
            QFileDialog::getOpenFileName(this, Xlate("Open"), GetInitialOpenDir(kareport::lastReportFolder),
                                         Xlate("Reports, jobs and templates (*.rep *.rtf *.json *.xml)") +
                                             QStringLiteral(";;") + Xlate("All files (*)"));
        return path.isEmpty() ? std::nullopt : std::optional(path);
    };
    askExportFile = [this](const kareport::SaveRequest &request) { return kareport::askSavePath(this, request); };
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
        keepsReportWindows_ = dialog.preferences().keepsReportWindows;
    }
}

void DeskFrame::about()
{
    kareport::AboutDialog(this).exec();
}

void DeskFrame::ShowHelp()
{
    const QWidget *focus = QApplication::focusWidget();
    kareport::showGuide(*this, kareport::guidePlaceFor(focus));
}

void DeskFrame::chooseCommand()
{
    UpdateCommands();
    kareport::CommandList list(kareport::listedCommands(*menuBar()), this);
    if (list.exec() == QDialog::Accepted && list.chosen() != nullptr) {
        UpdateCommands();
        list.chosen()->trigger();
    }
}

void DeskFrame::closeEvent(QCloseEvent *event)
{
    if (kareport::isJobRunning()) {
        event->ignore();
        kareport::noteExitCancelled();
        return;
    }
    QStringList open; // comes before the reports: the one in front is the last
    for (const kareport::OpenTemplateFile &file : kareport::openTemplates()) {
        open.append(file.path);
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
    kareport::keepSession(open + openFiles());
    UApplication::Get()->CloseAllDocuments();
    saveLayout();
    event->accept();
}

void DeskFrame::openDropped(const QStringList &files)
{
    for (const QString &file : files) {
        if (kareport::isDataName(file)) {
            fromTemplate(file);
        } else {
            OpenFile(file);
        }
    }
}
