#include "EditorHold.h"

#include "AppMessageBox.h"
#include "DeskPreferences.h"
#include "EditorLauncher.h"
#include "ProcessState.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QProcess>

#include <algorithm>

namespace kareport
{

namespace
{
constexpr int checkInterval = 500; // milliseconds
} // namespace

EditorHold::EditorHold()
{
    QObject::connect(&checkTimer_, &QTimer::timeout, &checkTimer_, [this] { checkPrograms(); });
    checkTimer_.setInterval(checkInterval);
    setEditorLauncher([this](const EditorLaunch &launch) { start(launch); });
}

EditorHold::~EditorHold()
{
    setEditorLauncher({});
}

void EditorHold::start(const EditorLaunch &launch)
{
    qint64 process = 0;
    auto *report = dynamic_cast<UReportDoc *>(launch.document);
    if (!QProcess::startDetached(launch.program, {launch.file}, launch.folder, &process)) {
        unstarted_.push_back(report);
        QTimer::singleShot(0, &checkTimer_, [this, report, program = launch.program] { showInstead(report, program); });
        return;
    }
    if (report != nullptr) {
        const bool isKept = loadPreferences().keepsForEditor;
        if (isKept) {
            report->EnableCloseOption(false);
        }
        held_.push_back({report, process, isKept});
        checkTimer_.start();
    }
}

void EditorHold::showInstead(UReportDoc *report, const QString &program)
{
    const bool isThere = std::erase(unstarted_, report) > 0;
    if (isThere && UReportDoc::IsReportAvailable(report)) {
        report->SetExternalEditorFlag(false);
        report->SetModifiedFlag(true); // it is saved nowhere but in a temporary file
        report->UpdateAllViews(nullptr, 0, nullptr);
    }
    AppMessageBox(Xlate("\"%1\" could not be started. Choose another program under Preferences.").arg(program));
}

bool EditorHold::holds(const UReportDoc &report) const
{
    const auto isOfReport = [&report](const Held &held) { return held.report == &report; };
    const bool isCopied = report.GetExternalEditorFlag() && !report.IsModified();
    return std::any_of(held_.begin(), held_.end(), isOfReport) || (isCopied && !held_.empty()) ||
           std::find(unstarted_.begin(), unstarted_.end(), &report) != unstarted_.end();
}

void EditorHold::forget(const UReportDoc *report)
{
    std::erase_if(held_, [report](const Held &held) { return held.report == report; });
    std::erase(unstarted_, report);
}

void EditorHold::checkPrograms()
{
    const auto ended = std::stable_partition(held_.begin(), held_.end(), [](const Held &held) {
        return isProcessRunning(held.process) && UReportDoc::IsReportAvailable(held.report);
    });
    const std::vector<Held> released(ended, held_.end());
    held_.erase(ended, held_.end());
    for (const Held &held : released) {
        // Another editor may still hold it.
        const bool isHeld = std::any_of(held_.begin(), held_.end(), [&held](const Held &other) {
            return other.report == held.report && other.isKept;
        });
        if (held.isKept && !isHeld && UReportDoc::IsReportAvailable(held.report)) {
            held.report->EnableCloseOption(true);
        }
    }
    if (held_.empty()) {
        checkTimer_.stop();
    }
}

} // namespace kareport
