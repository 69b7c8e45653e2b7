#include "JobLauncher.h"

#include "CViewPane.h"
#include "DataKind.h"
#include "DeskPreferences.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "Progress.h"
#include "ReportWindow.h"
#include "ReportWindowEntry.h"
#include "ValueGuard.h"
#include "WorkDialog.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QFileInfo>

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

/// Shows progress in a dialog, and lets the windows answer while the work runs.
class DialogProgress : public Progress
{
public:
    explicit DialogProgress(QWidget *parent) : Progress(true), dialog_(parent, [] { setInterrupted(true); }) {}

    void finish() override { dialog_.hide(); }

protected:
    void show(std::size_t done) override
    {
        if (!dialog_.isDue()) {
            QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
            return;
        }
        dialog_.show(what(), total() > 0 ? static_cast<int>(std::min(done, total()) * 100 / total()) : -1);
        QCoreApplication::processEvents();
    }

private:
    WorkDialog dialog_;
};

bool &runningJob()
{
    static bool isRunning = false;
    return isRunning;
}

void closeReport(UReportDoc *report)
{
    if (UReportDoc::IsReportAvailable(report)) {
        report->OnCloseDocument();
    }
}

void setWindowCaption(const UReportDoc &report, const QString &caption)
{
    CViewPane *pane = report.GetReportWindow() != nullptr ? report.GetReportWindow()->GetOwningPane() : nullptr;
    if (pane != nullptr) {
        pane->SetWindowTextW(caption);
    }
}

/// A report that is shown in a report window while it is written, whatever editor the user prefers.
UReportDoc *makeShown(bool header, const QString &caption)
{
    // The job gives the title.
    UReportDoc *report = CreateReportWindow(QString(), header, false);
    if (report != nullptr) {
        setWindowCaption(*report, caption);
    }
    return report;
}

/// The data file of a job that is not a regular file: reading a pipe or a device might never end, and nothing could
/// stop it.
std::optional<InputError> dataThatIsNoFile(const Job &job, const JsonSource &source)
{
    QStringList names = job.data.keys();
    names.sort();
    for (const QString &name : names) {
        const Job::DataSet &set = *job.data.constFind(name);
        const JsonPath place = {QStringLiteral("data"), name, set.kind};
        if (set.source->readsStandardInput()) {
            return source.errorAt(place, Xlate("a window has no standard input: a file was expected"));
        }
        for (const QString &file : set.source->files()) {
            if (QFileInfo(file).exists() && !QFileInfo(file).isFile()) {
                return source.errorAt(place, unreadableData(file, Xlate("it is a folder, a pipe or a device")));
            }
        }
    }
    return std::nullopt;
}

/// Ends rich-text mode, which belongs to the files of a job: while it is on, the view shows what was written, and neither
/// what is typed nor what is loaded.
void endRichTextMode(UReportDoc *report)
{
    if (UReportDoc::IsReportAvailable(report)) {
        report->SetRTFDataFlag(false);
    }
}

/// Runs a job that has been read. @return the report; null when it was not made
UReportDoc *makeReport(const Job &job, const JsonSource &source, QWidget *parent, QString &error, JobNotes &notes)
{
    DialogProgress progress(parent);
    UReportDoc *report = makeShown(job.header, job.title.value_or(QFileInfo(source.path()).completeBaseName()));
    if (report == nullptr) {
        error = InputError{source.path(), std::nullopt, Xlate("the report could not be made")}.message();
        return nullptr;
    }
    std::optional<InputError> wrong;
    try {
        JobRunner runner(job, source, progress);
        wrong = runner.run(*report);
        notes = runner.notes();
    } catch (const std::bad_alloc &) {
        endRichTextMode(report);
        closeReport(report); // half a report counts as none
        throw;
    }
    if (wrong) {
        error = wrong->message();
    }
    endRichTextMode(report);
    if (wrong || isInterrupted()) {
        closeReport(report);
        return nullptr;
    }
    setWindowCaption(*report, report->GetTitle());
    report->SetReportWindowActive();
    return report;
}

UReportDoc *runJob(const Expected<JsonSource> &read, QWidget *parent, QString &error, JobNotes &notes)
{
    if (const InputError *wrong = errorOf(read)) {
        error = wrong->message();
        return nullptr;
    }
    const auto &source = std::get<JsonSource>(read);
    const auto job = readJob(source, loadPreferences().jobDefaults());
    if (const InputError *wrong = errorOf(job)) {
        error = wrong->message();
        return nullptr;
    }
    if (const auto wrong = dataThatIsNoFile(std::get<Job>(job), source)) {
        error = wrong->message();
        return nullptr;
    }
    return makeReport(std::get<Job>(job), source, parent, error, notes);
}

template <typename Read>
UReportDoc *launch(const Read &read, QWidget *parent, QString &error, JobNotes &notes)
{
    if (runningJob()) {
        error = Xlate("Another job is running. Wait until it has finished, or cancel it.");
        return nullptr;
    }
    const ValueGuard running(runningJob(), true, [](bool on) { runningJob() = on; });
    setInterrupted(false);
    try {
        return runJob(read(), parent, error, notes);
    } catch (const std::bad_alloc &) {
        error = Xlate("There is not enough memory for this input.");
        return nullptr;
    }
}

} // namespace

bool isJobRunning()
{
    return runningJob();
}

UReportDoc *launchJob(const QString &path, QWidget *parent, QString &error, JobNotes &notes)
{
    return launch([&path] { return JsonSource::read(path); }, parent, error, notes);
}

QString launchExport(const JobOrigin &origin, const QString &file, QWidget *parent, QStringList &warnings)
{
    if (runningJob()) {
        return Xlate("Another job is running. Wait until it has finished, or cancel it.");
    }
    const ValueGuard running(runningJob(), true, [](bool on) { runningJob() = on; });
    setInterrupted(false);
    try {
        DialogProgress progress(parent);
        return exportJob(origin, file, progress, warnings);
    } catch (const std::bad_alloc &) {
        return Xlate("There is not enough memory for this input.");
    }
}

UReportDoc *launchTemplateJob(const TemplateJob &job, QWidget *parent, QString &error, JobNotes &notes)
{
    return launch([&job] { return Expected<JsonSource>(JsonSource::fromObject(job.toJson())); }, parent, error, notes);
}

} // namespace kareport
