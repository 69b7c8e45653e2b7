#include "RenderJob.h"

#include "CommandSetup.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "LeastSize.h"
#include "OutputClash.h"
#include "OutputWriter.h"
#include "OutputsWriter.h"
#include "ProcessSetup.h"
#include "ReportTextCodec.h"
#include "Signals.h"
#include "SizeLimit.h"
#include "Xlate.h"

#include <QFileInfo>

#include <algorithm>

namespace kareport
{

namespace
{

/// A report of so many bytes is worth a word before it is made.
constexpr qint64 largeReport = qint64(100) << 20;

} // namespace

RenderJob::RenderJob(const RenderCommand &command, Expected<JsonSource> source)
    : command_(command), limit_(command.limit ? sizeFromText(*command.limit) : std::nullopt)
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
    checkOutputs();
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
    for (Output &output : job_.outputs) {
        output.mostBytes = limit_;
    }
}

/// No output may take the place of what the report is made of, or of another output.
void RenderJob::checkOutputs()
{
    const auto clash = outputClash(job_, source_.path());
    if (!clash) {
        return;
    }
    const JsonNode output = JsonNode(source_)["output"];
    if (command_.outputs.isEmpty() && output.exists()) {
        output[clash->output].fail(clash->text);
        fail(exitInput, source_.error()->message());
    } else {
        fail(clash->text);
    }
}

/// Says how large the report will be at least, where that is much or too much.
ExitStatus RenderJob::checkSize()
{
    const qint64 least = leastSize(job_);
    if (limit_ && least > *limit_) {
        return failTooLarge(least);
    }
    if (least >= largeReport && !command_.quiet) {
        printError(Xlate("kareport: the report will have at least %1").arg(sizeText(least)));
    }
    return exitDone;
}

ExitStatus RenderJob::failTooLarge(qint64 bytes)
{
    return fail(exitOutput,
                Xlate("kareport: nothing was written: the report has at least %1, more than the limit of %2")
                    .arg(sizeText(bytes), sizeText(*limit_)));
}

/// Whether the text exceeds the limit also when every second character is one that plain text does without.
bool RenderJob::isTooLarge(const UReportDoc *report) const
{
    return limit_ && report != nullptr && report->GetTextLength() / 2 > *limit_;
}

bool RenderJob::isReaderGone() const
{
    return std::any_of(job_.outputs.begin(), job_.outputs.end(),
                       [](const Output &output) { return output.isStandardOutput(); }) &&
           isOutputReaderGone();
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

ExitStatus RenderJob::madeStatus(JobRunner &runner, const std::optional<InputError> &error)
{
    if (isInterrupted()) {
        if (!command_.isBatch()) {
            printError(Xlate("kareport: stopped; nothing was written"));
        }
        return exitInterrupted;
    }
    if (isReaderGone()) {
        endByClosedReader();
        return exitOutput;
    }
    if (isTooLarge(runner.madeReport())) {
        return failTooLarge(runner.report().GetTextLength() / 2);
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
                  : madeStatus(runner, inputError);
}

ExitStatus RenderJob::run(Progress &progress)
{
    if (checkSize() != exitDone) {
        return status_;
    }
    JobRunner runner(job_, source_, progress);
    runner.stopWhen([this, &runner] { return isReaderGone() || isTooLarge(runner.madeReport()); });
    if (const Output *output = streamedOutput()) {
        if (const auto status = runIntoOutput(runner, *output, progress)) {
            return status_ = *status;
        }
    }
    const auto error = runner.run();
    progress.finish();
    status_ = madeStatus(runner, error);
    if (status_ == exitDone) {
        status_ = writeOutputs(runner.report(), job_.outputs, progress, command_.quiet);
    }
    return status_;
}

} // namespace kareport
