#include "RenderJob.h"

#include "CommandSetup.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "OutputWriter.h"
#include "OutputsWriter.h"
#include "Xlate.h"

#include <QFileInfo>

#include <algorithm>

namespace kareport
{

RenderJob::RenderJob(const RenderCommand &command, Expected<JsonSource> source) : command_(command)
{
    if (const InputError *error = errorOf(source)) {
        fail(exitInput, error->message());
        return;
    }
    source_ = std::move(std::get<JsonSource>(source));
    if (const auto wrong = applySets(source_, command.sets)) {
        fail(exitUsage, QStringLiteral("kareport: ") + *wrong);
        return;
    }
    const auto kindOtherwise = outputKindFromName(command.as);
    job_ = readJob(source_, kindOtherwise);
    if (source_.error()) {
        fail(exitInput, source_.error()->message());
        return;
    }
    takeOutputs(kindOtherwise);
}

void RenderJob::takeOutputs(std::optional<OutputKind> kindOtherwise)
{
    if (!command_.outputs.isEmpty()) {
        job_.outputs.clear();
        for (QString file : command_.outputs) {
            if (!source_.path().isEmpty()) {
                file.replace(QStringLiteral("{}"), QFileInfo(source_.path()).completeBaseName());
            }
            job_.outputs.push_back({file, *outputKindOf(file, kindOtherwise)});
        }
    } else if (job_.outputs.empty()) {
        job_.outputs.push_back({QStringLiteral("-"), *outputKindOf(QStringLiteral("-"), kindOtherwise)});
    }
}

bool RenderJob::needsFonts() const
{
    return JobRunner::needsFonts(job_) || kareport::needsFonts(job_.outputs);
}

void RenderJob::fail(const QString &text)
{
    fail(exitInput, InputError{source_.path(), std::nullopt, text}.message());
}

ExitStatus RenderJob::fail(ExitStatus status, const QString &message)
{
    printError(message);
    status_ = status;
    return status;
}

/// The output that the text of the report can go to while it is written; null when the whole report must be there first:
/// for any other kind, for several outputs, for what is no file and so cannot be taken back, and for a report that is
/// emptied on the way.
const Output *RenderJob::streamedOutput() const
{
    const Output &output = job_.outputs.front();
    const QFileInfo file(output.file);
    const bool isText = output.kind == OutputKind::Report || output.kind == OutputKind::Text;
    const bool isFile = !output.isStandardOutput() && (file.isFile() || !file.exists());
    const bool isEmptied = std::any_of(job_.steps.begin(), job_.steps.end(), [](const Job::Step &step) {
        return std::holds_alternative<Job::Clear>(step.action);
    });
    return job_.outputs.size() == 1 && isText && isFile && !isEmptied ? &output : nullptr;
}

ExitStatus RenderJob::madeStatus(const std::optional<InputError> &error)
{
    if (isInterrupted()) {
        if (!command_.isBatch()) {
            printError(Xlate("kareport: stopped; nothing was written"));
        }
        return exitInterrupted;
    }
    return error ? fail(exitInput, error->message()) : exitDone;
}

/// Makes the report straight into its output. @return nothing, and nothing made, when the output cannot be opened
std::optional<ExitStatus> RenderJob::runIntoOutput(JobRunner &runner, const Output &output, Progress &progress)
{
    bool isOpen = false;
    bool isMade = false;
    bool isEmpty = false;
    std::optional<InputError> inputError;
    const bool isReport = output.kind == OutputKind::Report; // an empty one makes no file
    const auto outputError = replaceOutput(output, [&](QIODevice &device) {
        isOpen = true;
        ReportTextWriter writer(device, isReport ? LineEnds::ReportFile : LineEnds::PlainText);
        inputError = runner.run(&writer);
        if (inputError || isInterrupted()) {
            if (UReportDoc *report = runner.madeReport()) {
                report->StreamText(nullptr);
            }
            return false;
        }
        isMade = true;
        const bool isWritten = runner.report().EndTextStream(writer);
        isEmpty = isWritten && writer.isEmpty();
        return isWritten && !(isEmpty && isReport);
    });
    if (!isOpen) {
        return std::nullopt;
    }
    progress.finish();
    // What comes when the report is made is too late to stop it.
    return isMade ? sayWritten(output, isEmpty && isReport ? std::nullopt : outputError, isEmpty, command_.quiet)
                  : madeStatus(inputError);
}

ExitStatus RenderJob::run(Progress &progress)
{
    JobRunner runner(job_, source_, progress);
    if (const Output *output = streamedOutput()) {
        if (const auto status = runIntoOutput(runner, *output, progress)) {
            return status_ = *status;
        }
    }
    const auto error = runner.run();
    progress.finish();
    status_ = madeStatus(error);
    if (status_ == exitDone) {
        status_ = writeOutputs(runner.report(), job_.outputs, progress, command_.quiet);
    }
    return status_;
}

} // namespace kareport
