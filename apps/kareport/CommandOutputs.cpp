#include "CommandOutputs.h"

#include "Interrupt.h"
#include "Signals.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

ExitStatus stoppedBefore(const Output &output)
{
    printError(Xlate("kareport: stopped before \"%1\" was written").arg(output.file));
    return exitInterrupted;
}

} // namespace

ExitStatus sayWritten(const Output &output, const OutputResult &result, bool isEmpty, bool quiet,
                      const OutputFolders &folders)
{
    if (result.problem) {
        const auto reason = folders.whyNotWritten(output.file);
        printError(QStringLiteral("kareport: ") +
                   (reason ? Xlate("\"%1\" could not be written: %2").arg(output.file, *reason) : *result.problem));
    }
    if (!result.isWritten()) {
        return exitOutput;
    }
    if (!quiet && isEmpty && output.kind == OutputKind::Report) {
        printError(Xlate("kareport: the report is empty: \"%1\" was not written").arg(output.file));
    }
    return exitDone;
}

ExitStatus writeOutputs(UReportDoc &report, const std::vector<Output> &outputs, Progress &progress, bool quiet,
                        const OutputFolders &folders, JobNotes *notes, const ResultOutputs *results)
{
    ExitStatus status = exitDone;
    for (const Output &output : outputs) {
        if (isInterrupted()) {
            return stoppedBefore(output);
        }
        if (output.kind == OutputKind::Pdf && makesNoPage(report)) {
            // The library makes a document without a page of it, which readers refuse.
            printError(Xlate("kareport: the report is empty, and a PDF has at least one page: \"%1\" was not written")
                           .arg(output.file));
            status = std::max(status, exitInput);
            continue;
        }
        if (!output.isStandardOutput()) {
            progress.begin(Xlate("Writing %1").arg(output.file), 0);
        }
        folders.prepare(output.file);
        const OutputResult result =
            writeOutput(report, output, progress, results != nullptr ? results->fileOf(output) : nullptr);
        if (result.isReaderGone) {
            progress.finish();
            endByClosedReader();
            return exitOutput; // where the signal is switched off, nothing more is written either
        }
        progress.finish();
        if (!result.isWritten() && isInterrupted()) {
            return stoppedBefore(output);
        }
        for (const QString &warning : quiet ? QStringList() : result.warnings) {
            printError(Xlate("kareport: warning: \"%1\": %2").arg(output.file, warning));
        }
        for (const JobNote &note : result.notes) {
            if (notes != nullptr) {
                notes->add(note);
            }
        }
        status = std::max(status, sayWritten(output, result, report.IsEmpty(), quiet, folders));
    }
    return status;
}

} // namespace kareport
