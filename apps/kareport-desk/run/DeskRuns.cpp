#include "DeskRuns.h"

#include "AppMessageBox.h"
#include "JobLauncher.h"
#include "NotesPane.h"
#include "ReportSaveName.h"
#include "SaveAs.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UXTPMDIFrameWnd.h"
#include "UnitsBar.h"
#include "Xlate.h"

#include <QStatusBar>
#include <QToolButton>

namespace kareport
{

namespace
{

constexpr int frontInterval = 200; // milliseconds

} // namespace

DeskRuns::DeskRuns(UXTPMDIFrameWnd &frame)
    : frame_(frame),
      watch_([this](const QString &path) { fileChanged(path); }),
      followsFiles_(keptFollowsFiles()),
      count_(new QToolButton)
{
    count_->setAutoRaise(true);
    count_->setAccessibleName(Xlate("Number of notes"));
    count_->hide();
    connect(count_, &QToolButton::clicked, this, [this] { notesPane().open(); });
    frame.statusBar()->addPermanentWidget(count_);
    changedTimer_.setSingleShot(true);
    connect(&changedTimer_, &QTimer::timeout, this, [this] { runChanged(); });
    connect(&frontTimer_, &QTimer::timeout, this, [this] { showFront(); });
    frontTimer_.start(frontInterval);
    askJobFile = [this](const SaveRequest &request) -> std::optional<QString> {
        const std::optional<SaveChoice> choice = askSavePath(&frame_, request);
        return choice ? std::optional(choice->path) : std::nullopt;
    };
}

DeskRuns::~DeskRuns() = default;

DeskRuns::TextState DeskRuns::stateOf(const UReportDoc &report)
{
    return {report.GetEditCount(), report.GetTextLength()};
}

UReportDoc *DeskRuns::inFront() const
{
    return dynamic_cast<UReportDoc *>(frame_.GetCommandDocument());
}

DeskRuns::Made *DeskRuns::madeOf(const UDocument *report)
{
    const auto found = made_.find(report);
    return found != made_.end() ? &found->second : nullptr;
}

const DeskRuns::Made *DeskRuns::madeOf(const UDocument *report) const
{
    const auto found = made_.find(report);
    return found != made_.end() ? &found->second : nullptr;
}

const ReportRecipe *DeskRuns::recipeInFront() const
{
    return recipeOf(frame_.GetCommandDocument());
}

const ReportRecipe *DeskRuns::recipeOf(const UDocument *report) const
{
    const Made *made = madeOf(report);
    return made != nullptr ? &made->recipe : nullptr;
}

const JobNotes *DeskRuns::notesOf(const UDocument *report) const
{
    const Made *made = madeOf(report);
    return made != nullptr ? &made->notes : nullptr;
}

UReportDoc *DeskRuns::run(const ReportRecipe &recipe, QString &error)
{
    QStringList files;
    LaunchResult result;
    UReportDoc *report = launchJob(recipe, &frame_, result, hooksFor(files));
    error = result.error;
    if (report == nullptr) {
        for (const QString &file : files) {
            watch_.ceaseToExpect(file);
        }
        return nullptr;
    }
    made_.insert_or_assign(report, Made{recipe, result.notes, result.title, QString(), stateOf(*report), files});
    watch(files);
    ++state_;
    if (!result.notes.said().empty()) {
        notesPane().show();
    }
    return report;
}

void DeskRuns::forget(const UDocument *report)
{
    if (made_.erase(report) > 0) {
        changed_.erase(report);
        watch({});
        ++state_;
    }
}

bool DeskRuns::mayReplace(const UReportDoc &report, const TextState &made) const
{
    if (stateOf(report) == made) {
        return true;
    }
    const QString question =
        Xlate("\"%1\" has changes that were made by hand. Make it again and lose them?").arg(report.GetTitle());
    return showMessage({question, QString(), MessageButtons::YesNo, MessageIcon::Question}) == MessageAnswer::Yes;
}

bool DeskRuns::runAgain()
{
    UReportDoc *report = inFront();
    return report != nullptr && runAgain(*report, Reason::Asked);
}

bool DeskRuns::runAgain(UReportDoc &report, Reason reason)
{
    Made *made = madeOf(&report);
    if (made == nullptr) {
        return false;
    }
    if (!isJobRunning() && !mayReplace(report, made->text)) {
        made = madeOf(&report); // the question was open for as long as it took
        if (made != nullptr) {
            made->isKept = reason == Reason::FilesChanged;
        }
        return false;
    }
    made = madeOf(&report);
    if (made == nullptr || !UReportDoc::IsReportAvailable(&report)) {
        return false;
    }
    QStringList files;
    LaunchResult result;
    result.title = made->title;
    LaunchHooks hooks = hooksFor(files);
    // What was changed before has been asked about; what is changed while the job runs has not.
    hooks.mayReplace = [this, &report, before = stateOf(report)] { return mayReplace(report, before); };
    made->isOutdated = false; // what changes from now on is another change
    const ReportRecipe recipe = made->recipe;
    const bool isMade = launchAgain(report, recipe, &frame_, result, hooks);
    made = madeOf(&report); // unless it was closed meanwhile
    if (made != nullptr) {
        made->isKept = false;
        made->isOutdated = made->isOutdated || !isMade;
        made->problem = result.error;
        if (!files.isEmpty()) {
            made->files = files;
        }
        if (isMade) {
            made->notes = result.notes;
            made->title = result.title;
            made->text = stateOf(report);
        }
    }
    if (made == nullptr) {
        for (const QString &file : files) {
            watch_.ceaseToExpect(file);
        }
        files.clear();
    }
    watch(files);
    ++state_;
    if (made != nullptr && !result.error.isEmpty()) {
        noteFailed(report, result.error, reason);
    }
    showFront();
    return isMade;
}

void DeskRuns::noteFailed(UReportDoc &report, const QString &error, Reason reason)
{
    if (reason == Reason::Asked) {
        AppMessageBox(error);
        return;
    }
    // A file that is being written is seldom right: that is no reason for a message.
    notesPane().show();
    frame_.statusBar()->showMessage(Xlate("\"%1\" was not made again: %2").arg(report.GetTitle(), error));
}

bool DeskRuns::runWith(UReportDoc &report, const QJsonObject &changed)
{
    Made *made = madeOf(&report);
    if (made == nullptr || changed.isEmpty()) {
        return false;
    }
    const QJsonObject before = made->recipe.settings;
    for (auto setting = changed.begin(); setting != changed.end(); ++setting) {
        made->recipe.settings.insert(setting.key(), setting.value());
    }
    const bool isMade = runAgain(report, Reason::Asked);
    made = madeOf(&report);
    if (!isMade && made != nullptr) {
        made->recipe.settings = before;
        ++state_; // the bar shows those before again
    }
    showFront();
    return isMade;
}

} // namespace kareport
