#include "JobLauncher.h"

#include "CViewPane.h"
#include "Interrupt.h"
#include "JobFiles.h"
#include "JobRunner.h"
#include "ReportReplacing.h"
#include "ReportWindow.h"
#include "ReportWindowEntry.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <QFileInfo>

#include <new>

namespace kareport
{

namespace
{

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

/// Ends rich-text mode, which belongs to the files of a job: while it is on, the view shows what was written, and neither
/// what is typed nor what is loaded.
void endRichTextMode(UReportDoc *report)
{
    if (UReportDoc::IsReportAvailable(report)) {
        report->SetRTFDataFlag(false);
    }
}

/// The title that a report has been given, whatever number was put after it.
QString givenTitle(const Job &job, const UReportDoc &report)
{
    const UXmlReportTpl *used = report.GetTemplate();
    return job.title.value_or(used != nullptr ? used->GetTemplateTitle() : QString());
}

/// Runs a job that has been read. @return the report; null when it was not made
UReportDoc *makeReport(const Job &job, const JsonSource &source, QWidget *parent, LaunchResult &result)
{
    DialogProgress progress(parent);
    UReportDoc *report = makeShown(job.header, job.title.value_or(QFileInfo(source.path()).completeBaseName()));
    if (report == nullptr) {
        result.error = InputError{source.path(), std::nullopt, Xlate("the report could not be made")}.message();
        return nullptr;
    }
    std::optional<InputError> wrong;
    try {
        JobRunner runner(job, source, progress);
        wrong = runner.run(*report);
        result.notes = runner.notes();
    } catch (const std::bad_alloc &) {
        endRichTextMode(report);
        closeReport(report); // an incomplete report is discarded
        throw;
    }
    if (wrong) {
        result.error = wrong->message();
    }
    endRichTextMode(report);
    if (wrong || isInterrupted()) {
        closeReport(report);
        return nullptr;
    }
    result.title = givenTitle(job, *report);
    setWindowCaption(*report, report->GetTitle());
    report->SetReportWindowActive();
    return report;
}

/// Runs a job that has been read into a new report, and puts that into a shown one. @return whether it did
bool makeAgain(UReportDoc &report, const Job &job, const JsonSource &source, QWidget *parent, LaunchResult &result,
               const LaunchHooks &hooks)
{
    DialogProgress progress(parent);
    WrittenReport made(surroundingsOf(job), report);
    JobRunner runner(job, source, progress);
    const auto wrong = runner.run(made.report());
    endRichTextMode(&made.report());
    progress.finish();
    if (wrong) {
        result.error = wrong->message();
    }
    // The question may be open for long, and the report closed by then.
    if (wrong || isInterrupted() || !UReportDoc::IsReportAvailable(&report) ||
        (hooks.mayReplace && !hooks.mayReplace()) || !UReportDoc::IsReportAvailable(&report))
    {
        return false;
    }
    result.notes = runner.notes();
    const QString title = givenTitle(job, made.report());
    if (title != result.title && report.GetPathName().isEmpty()) { // a report that was saved has the name of its file
        report.SetTitle(title);
        setWindowCaption(report, report.GetTitle());
    }
    result.title = title;
    made.putInto(report);
    return true;
}

void tellFiles(const LaunchHooks &hooks, const Job &job, const JsonSource &source)
{
    if (hooks.aboutToRead) {
        hooks.aboutToRead(watchedFiles(job, source.path()));
    }
}

} // namespace

UReportDoc *launchJob(const ReportRecipe &recipe, QWidget *parent, LaunchResult &result, const LaunchHooks &hooks)
{
    UReportDoc *report = nullptr;
    doWithJob(recipe, result.error, [&](const Job &job, const JsonSource &source) {
        tellFiles(hooks, job, source);
        report = makeReport(job, source, parent, result);
    });
    return report;
}

bool launchAgain(UReportDoc &report, const ReportRecipe &recipe, QWidget *parent, LaunchResult &result,
                 const LaunchHooks &hooks)
{
    bool isMade = false;
    doWithJob(recipe, result.error, [&](const Job &job, const JsonSource &source) {
        tellFiles(hooks, job, source);
        isMade = makeAgain(report, job, source, parent, result, hooks);
    });
    return isMade;
}

ExportResult launchExport(const ReportRecipe &recipe, const QString &file, QWidget *parent, const AskTable &askTable)
{
    ExportResult result;
    doAsOnlyJob(result.error, [&] {
        JobExport values;
        result.error = values.open(recipe, file);
        if (!result.error.isEmpty()) {
            return;
        }
        if (!values.choices().isEmpty()) {
            const auto choice = askTable(values.choices());
            if (!choice) {
                return;
            }
            values.choose(*choice);
        }
        DialogProgress progress(parent);
        result.error = values.write(progress, result.warnings);
        result.isWritten = result.error.isEmpty() && !isInterrupted();
    });
    return result;
}

} // namespace kareport
