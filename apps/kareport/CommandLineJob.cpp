#include "CommandLineJob.h"

#include "CommandOutputs.h"
#include "CommandSetup.h"
#include "Interrupt.h"
#include "JobFiles.h"
#include "JobReader.h"
#include "LeastSize.h"
#include "NotesFile.h"
#include "ProcessSetup.h"
#include "ReportTextCodec.h"
#include "ReportTextWriter.h"
#include "Signals.h"
#include "SizeLimit.h"
#include "Xlate.h"

#include <algorithm>
#include <new>

namespace kareport
{

CommandLineJob::CommandLineJob(const RenderCommand &command, Expected<JsonSource> source)
    : command_(command), folders_(command.parents)
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
    auto job = readJob(source_, {.outputKind = kindOtherwise});
    if (const InputError *error = errorOf(job)) {
        fail(exitInput, error->message());
        return;
    }
    job_ = std::move(std::get<Job>(job));
    takeOutputs(kindOtherwise);
    checkOutputs();
}

void CommandLineJob::takeOutputs(std::optional<OutputKind> kindOtherwise)
{
    if (!command_.outputs.isEmpty()) {
        job_.outputs.clear();
        for (const QString &output : command_.outputs) {
            const QString file = namedAfterJob(output, source_.path());
            job_.outputs.push_back({file, *outputKindOf(file, kindOtherwise)});
        }
    } else if (job_.outputs.empty()) {
        job_.outputs.push_back({QStringLiteral("-"), *outputKindOf(QStringLiteral("-"), kindOtherwise)});
    }
    const auto limit = command_.limit ? sizeFromText(*command_.limit) : std::nullopt;
    for (Output &output : job_.outputs) {
        output.mostBytes = limit;
    }
}

/// The file that the notes go to; empty for none.
QString CommandLineJob::notesFile() const
{
    return namedAfterJob(command_.notes.value_or(QString()), source_.path());
}

bool CommandLineJob::isReaderGone() const
{
    return std::any_of(job_.outputs.begin(), job_.outputs.end(),
                       [](const Output &output) { return output.isStandardOutput(); }) &&
           isOutputReaderGone();
}

bool CommandLineJob::needsFonts() const
{
    return !job_.page.isFixed() || kareport::needsFonts(job_.outputs);
}

void CommandLineJob::fail(const QString &text)
{
    fail(exitInput, InputError{source_.path(), std::nullopt, text}.message());
}

ExitStatus CommandLineJob::fail(ExitStatus status, const QString &message)
{
    printError(message);
    status_ = status;
    return status;
}

ExitStatus CommandLineJob::madeStatus(const UReportDoc &report, const std::optional<InputError> &error)
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
    if (isTooLarge(job_, leastSize(report))) {
        return failTooLarge(leastSize(report));
    }
    return error ? fail(exitInput, error->message()) : exitDone;
}

/// Makes the report, and says what there is to note.
std::optional<InputError> CommandLineJob::make(JobRunner &runner, UReportDoc &report, ReportTextWriter *stream)
{
    if (command_.strict) {
        runner.beStrict();
    }
    auto error = runner.run(report, stream);
    if (!isInterrupted() && !isReaderGone()) {
        notes_ = runner.notes();
        hasNotes_ = true;
        sayNotes(error);
    }
    return error;
}

/// Writes the report directly into its output. @return nothing, and nothing made, when the output cannot be opened
std::optional<ExitStatus> CommandLineJob::runIntoOutput(JobRunner &runner, UReportDoc &report, const Output &output,
                                                        Progress &progress)
{
    bool isOpen = false;
    bool isMade = false;
    bool isEmpty = false;
    std::optional<InputError> inputError;
    const bool isReport = output.kind == OutputKind::Report; // an empty report makes no file
    const auto problem = replaceOutput(output, [&](QIODevice &device, QString & /*problem*/) {
        isOpen = true;
        ReportTextWriter writer(device, isReport ? LineEnds::ReportFile : LineEnds::PlainText);
        inputError = make(runner, report, &writer);
        if (inputError || isInterrupted()) {
            return false;
        }
        isMade = true;
        const bool isWritten = report.EndTextStream(writer);
        if (!isWritten && writer.lacksMemory()) {
            throw std::bad_alloc(); // the output itself is sound
        }
        isEmpty = isWritten && writer.isEmpty();
        return isWritten && !(isEmpty && isReport);
    });
    if (!isOpen) {
        return std::nullopt;
    }
    progress.finish();
    // An interrupt after the report is made is too late to stop it.
    return isMade
               ? sayWritten(output, {isEmpty && isReport ? std::nullopt : problem}, isEmpty, command_.quiet, folders_)
               : madeStatus(report, inputError);
}

ExitStatus CommandLineJob::run(Progress &progress)
{
    if (checkSize() != exitDone) {
        return status_;
    }
    // It is not a user's report: neither the user's preferences nor a printer are asked for it.
    UReportDoc report(surroundingsOf(job_));
    JobRunner runner(job_, source_, progress);
    runner.stopWhen([this] { return isReaderGone(); });
    ResultOutputs results(job_);
    if (!results.isEmpty()) {
        runner.setResults(&results);
        runner.discardUnwantedText();
    }
    const Output *streamed = streamedOutput(job_);
    const auto files = std::count_if(job_.outputs.begin(), job_.outputs.end(),
                                     [](const Output &output) { return !output.isStandardOutput(); });
    progress.expectPieces(readingsOf(job_) + (streamed != nullptr ? 0 : static_cast<std::size_t>(files)));
    if (streamed != nullptr) {
        folders_.prepare(streamed->file);
        if (const auto status = runIntoOutput(runner, report, *streamed, progress)) {
            return status_ = withNotes(*status);
        }
    }
    const auto error = make(runner, report, nullptr);
    progress.finish();
    status_ = madeStatus(report, error);
    if (status_ == exitDone) {
        status_ = checkCharacters(report, progress);
    }
    if (status_ == exitDone) {
        checkPages(results);
    }
    if (status_ == exitDone) {
        describePdfs(job_, report, job_.outputs);
        status_ = writeOutputs(report, job_.outputs, progress, command_.quiet, folders_, &notes_, &results);
    }
    return status_ = withNotes(status_);
}

/// Writes the file of the notes. A status of a report that is good is that of its notes.
ExitStatus CommandLineJob::withNotes(ExitStatus status) const
{
    const bool areWritten = !command_.notes || !hasNotes_ || writeNotesFile(notes_, notesFile(), folders_);
    return status == exitDone && !areWritten ? exitOutput : status;
}

} // namespace kareport
