// What is checked of a job before its report is made and before it is written.

#include "CommandLineJob.h"

#include "CommandOutputs.h"
#include "JobFiles.h"
#include "JobOutputs.h"
#include "LeastSize.h"
#include "Printing.h"
#include "ResultOutputs.h"
#include "SizeLimit.h"
#include "TerminalProgress.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

/// A report of this many bytes is announced before it is made.
constexpr qint64 largeReport = qint64(100) << 20;

} // namespace

/// No output may replace what the report is made of, or another output.
void CommandLineJob::checkOutputs()
{
    auto clash = outputClash(job_, source_.path());
    clash = clash ? clash : ResultOutputs::wrongResult(job_);
    if (!clash) {
        // Notes are an output as well, though no job has them among its own.
        std::vector<Output> withNotes = job_.outputs;
        withNotes.push_back({notesFile(), OutputKind::Text});
        const auto other = command_.notes ? outputClash(job_, withNotes, source_.path()) : std::nullopt;
        if (other) {
            fail(other->text);
        }
        return;
    }
    const QString key = QStringLiteral("output");
    if (command_.outputs.isEmpty() && source_.root().toObject().contains(key)) {
        fail(exitInput, source_.errorAt({key, clash->output}, clash->text).message());
    } else {
        fail(clash->text);
    }
}

/// Pages that a long report goes on in must not replace anything that is needed either.
void CommandLineJob::checkPages(const ResultOutputs &results)
{
    std::vector<Output> outputs = job_.outputs;
    for (const Output &page : results.furtherPages()) {
        outputs.push_back(page);
    }
    const auto clash = outputs.size() > job_.outputs.size() ? outputClash(job_, outputs, source_.path()) : std::nullopt;
    if (clash) {
        fail(clash->text);
    }
}

/// Says how large the report will be at least, where that is much or too much.
ExitStatus CommandLineJob::checkSize()
{
    const qint64 least = leastSize(job_);
    if (isTooLarge(job_, least)) {
        return failTooLarge(least);
    }
    if (least >= largeReport && !command_.quiet) {
        printError(Xlate("kareport: the report will have at least %1").arg(sizeText(least)));
    }
    return exitDone;
}

ExitStatus CommandLineJob::failTooLarge(qint64 bytes)
{
    return fail(exitOutput,
                Xlate("kareport: nothing was written: the report has at least %1, more than the limit of %2")
                    .arg(sizeText(bytes), sizeText(*sizeLimit(job_))));
}

void CommandLineJob::sayNotes(const std::optional<InputError> &error)
{
    for (const JobNote &note : notes_.said()) {
        const bool isError = isStrict() && note.isMistake();
        // One of the notes that are errors is the error that ends the job, which is reported after them.
        const bool endsJob = isError && error && error->message() == note.about.message();
        if (!endsJob && (isError || !command_.quiet)) {
            eraseProgress();
            printError(isError ? note.about.message() : note.message());
        }
    }
}

/// Says which characters an output would not show, where that is an error.
ExitStatus CommandLineJob::checkCharacters(UReportDoc &report, Progress &progress)
{
    ExitStatus status = exitDone;
    for (const Output &output : isStrict() ? job_.outputs : std::vector<Output>()) {
        for (const JobNote &note : unshownCharacters(report, output, progress)) {
            notes_.add(note);
            status = fail(exitInput, note.about.message());
        }
    }
    return status;
}

} // namespace kareport
