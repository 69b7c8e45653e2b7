#include "JobCheck.h"

#include "Interrupt.h"
#include "JobFiles.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "ReportTextWriter.h"
#include "TemplateCheck.h"
#include "TemplateSource.h"
#include "UReportDoc.h"

#include <QIODevice>

#include <algorithm>

namespace kareport
{

namespace
{

/// Takes the text of a report that is not kept.
class NoDevice : public QIODevice
{
public:
    NoDevice() { open(QIODevice::WriteOnly | QIODevice::Unbuffered); }

protected:
    qint64 readData(char * /*data*/, qint64 /*size*/) override { return -1; }
    qint64 writeData(const char * /*data*/, qint64 size) override { return size; }
};

void addTemplateRemarks(CheckedFile &checked, const QString &path, const TemplateFile &file,
                        const TemplateCheckScope &scope)
{
    for (const TemplateRemark &remark : checkTemplates(file, scope)) {
        checked.add(remark.isError, {path, remark.place, remark.text});
    }
}

/// What is wrong with the template of a job itself. A file that cannot be read is reported when the job is run.
void checkTemplateOf(const Job &job, CheckedFile &checked)
{
    if (!job.reportTemplate) {
        return;
    }
    const auto source = readTemplateSource(job.reportTemplate->file);
    if (const auto *file = std::get_if<TemplateFile>(&source)) {
        addTemplateRemarks(checked, job.reportTemplate->file, *file,
                           {job.reportTemplate->name, job.options.placeholders});
    }
}

void addNotes(CheckedFile &checked, const JobNotes &notes, bool isStrict)
{
    for (const JobNote &note : notes.all()) {
        // An assumed unit is worth a look before the report is printed, though not each time that it is.
        if (note.isToBeSaid() || note.kind == JobNote::Kind::AssumedUnit) {
            checked.add(isStrict && note.isMistake(), note.about);
        }
    }
    checked.notes = notes;
}

void runJob(Job job, const JsonSource &source, bool isStrict, CheckedFile &checked, Progress &progress)
{
    // All notes are wanted, not the first of them alone; and nothing is written, so that the text need not be kept.
    job.strict = false;
    job.outputs.clear();
    UReportDoc report(surroundingsOf(job));
    JobRunner runner(job, source, progress);
    runner.measure();
    progress.expectPieces(readingsOf(job));
    NoDevice device;
    ReportTextWriter writer(device, LineEnds::PlainText);
    const auto error = runner.run(report, &writer);
    progress.finish();
    addNotes(checked, runner.notes(), isStrict);
    checked.steps = runner.fits();
    checked.isStopped = isInterrupted();
    if (error) {
        checked.add(true, *error);
    }
}

} // namespace

bool CheckedFile::hasErrors() const
{
    return std::any_of(remarks.begin(), remarks.end(), [](const CheckRemark &remark) { return remark.isError; });
}

CheckedFile checkTemplateFile(const QString &file)
{
    CheckedFile checked;
    checked.file = file;
    const auto source = readTemplateSource(file);
    if (const InputError *error = errorOf(source)) {
        checked.add(true, *error);
    } else {
        addTemplateRemarks(checked, file, std::get<TemplateFile>(source), {});
    }
    return checked;
}

CheckedFile checkJob(const QString &file, const Expected<JsonSource> &source, bool isStrict, const QString &notesFile,
                     Progress &progress)
{
    CheckedFile checked;
    checked.file = file;
    checked.isJob = true;
    if (const InputError *error = errorOf(source)) {
        checked.add(true, *error);
        return checked;
    }
    const auto &json = std::get<JsonSource>(source);
    auto read = readJob(json);
    if (const InputError *error = errorOf(read)) {
        checked.add(true, *error);
        return checked;
    }
    auto &job = std::get<Job>(read);
    if (const auto clash = outputClash(job, json.path())) {
        checked.add(true, json.errorAt({QStringLiteral("output"), clash->output}, clash->text));
    }
    if (const auto wrong = ResultOutputs::wrongResult(job)) {
        checked.add(true, json.errorAt({QStringLiteral("output"), wrong->output}, wrong->text));
    }
    if (!notesFile.isEmpty()) {
        if (const auto clash = outputClash(job, {{notesFile, OutputKind::Text}}, json.path())) {
            checked.isNotesFileNeeded = true;
            checked.add(true, {json.path(), std::nullopt, clash->text});
        }
    }
    checkTemplateOf(job, checked);
    const bool areNotesErrors = isStrict || job.strict;
    runJob(std::move(job), json, areNotesErrors, checked, progress);
    return checked;
}

} // namespace kareport
