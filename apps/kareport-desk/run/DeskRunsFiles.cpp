// The files that reports are made of, and the file of a job.
#include "AppMessageBox.h"
#include "DeskPreferences.h"
#include "DeskRuns.h"
#include "Folders.h"
#include "JobLauncher.h"
#include "JobSaving.h"
#include "Profile.h"
#include "ReportSaveName.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UXTPMDIFrameWnd.h"
#include "Xlate.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QStatusBar>

#include <algorithm>

namespace kareport
{

namespace
{

const QString followEntry = QStringLiteral("Run When Files Change");
constexpr int laterTime = 300; // milliseconds

} // namespace

bool DeskRuns::keptFollowsFiles()
{
    return GetProfileString(QString(), followEntry) == u"1";
}

/// Notes how the files of a run are before they are read: what changes from then on is reported.
LaunchHooks DeskRuns::hooksFor(QStringList &files)
{
    LaunchHooks hooks;
    hooks.aboutToRead = [this, &files](const QStringList &read) {
        files = read;
        for (const QString &file : read) {
            watch_.expect(file);
        }
    };
    return hooks;
}

void DeskRuns::watch(const QStringList &files)
{
    for (const QString &file : files) {
        watch_.watch(file);
    }
    QStringList all;
    for (const auto &[report, made] : made_) {
        all += made.files;
    }
    watch_.retain(all);
}

void DeskRuns::setFollowsFiles(bool on)
{
    followsFiles_ = on;
    WriteProfileString(QString(), followEntry, on ? QStringLiteral("1") : QStringLiteral("0"));
    for (const auto &[report, made] : made_) {
        if (on && made.isOutdated) {
            changed_.insert(report);
            changedTimer_.start(0);
        }
    }
}

void DeskRuns::fileChanged(const QString &path)
{
    for (auto &[report, made] : made_) {
        if (made.files.contains(path)) {
            made.isOutdated = true;
            changed_.insert(report);
            changedTimer_.start(0);
        }
    }
}

/// Makes the reports again whose files have changed, or says that it can be done.
void DeskRuns::runChanged()
{
    if (isJobRunning() || QApplication::activeModalWidget() != nullptr) {
        changedTimer_.start(laterTime);
        return;
    }
    while (!changed_.empty()) {
        const UDocument *changed = *changed_.begin();
        changed_.erase(changed_.begin());
        const Made *made = madeOf(changed);
        const std::vector<UDocument *> open = UApplication::Get()->GetDocuments();
        const auto found = std::find(open.begin(), open.end(), changed);
        auto *report = found != open.end() ? dynamic_cast<UReportDoc *>(*found) : nullptr;
        if (made == nullptr || report == nullptr || !made->isOutdated) {
            continue;
        }
        if (followsFiles_ && !made->isKept) {
            runAgain(*report, Reason::FilesChanged);
        } else {
            frame_.statusBar()->showMessage(
                Xlate("Files of \"%1\" have changed. Press F5 to make it again.").arg(report->GetTitle()));
        }
    }
}

void DeskRuns::saveAsJob()
{
    const UDocument *report = inFront();
    const Made *made = madeOf(report);
    if (made == nullptr) {
        return;
    }
    const ReportRecipe recipe = made->recipe; // the report may be closed while the dialog is open
    const auto *chosen = std::get_if<TemplateJob>(&recipe.origin);
    const QFileInfo beside(chosen != nullptr ? chosen->mainFile() : recipe.jobFile());
    SaveRequest request;
    request.filter = Xlate("Jobs") + QStringLiteral(" (*.json)|*.json||");
    request.defaultExtension = QStringLiteral("json");
    request.initialFolder = beside.absoluteDir().exists() ? beside.absolutePath() : GetInitialOpenDir(lastReportFolder);
    request.fileName = beside.completeBaseName() + QStringLiteral(".json");
    request.flags = SaveRequest::overwritePrompt | SaveRequest::pathMustExist;
    const auto file = askJobFile(request);
    if (!file) {
        return;
    }
    const QString path = QFileInfo(*file).absoluteFilePath();
    if (const auto wrong = saveJob(recipe, loadPreferences().jobDefaults(), path)) {
        AppMessageBox(wrong->message());
        return;
    }
    SetLastOpenDir(path, lastReportFolder);
    UApplication::Get()->AddToRecentFileList(path);
    if (Made *saved = madeOf(report)) {
        const QString before = saved->recipe.jobFile();
        saved->recipe = ReportRecipe(path); // which has the settings of the report
        saved->files.removeOne(before.isEmpty() ? before : QFileInfo(before).absoluteFilePath());
        saved->files.prepend(path);
        watch(QStringList(path));
    }
    frame_.statusBar()->showMessage(Xlate("The job was saved as \"%1\".").arg(path));
}

} // namespace kareport
