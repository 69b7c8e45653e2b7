#include "OutputsWriter.h"

#include "Interrupt.h"
#include "OutputWriter.h"
#include "PdfFile.h"
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

bool needsFonts(const std::vector<Output> &outputs)
{
    return std::any_of(outputs.begin(), outputs.end(),
                       [](const Output &output) { return output.kind == OutputKind::RichText; });
}

ExitStatus sayWritten(const Output &output, const std::optional<QString> &error, bool isEmpty, bool quiet)
{
    if (error) {
        if (!error->isEmpty()) {
            printError(QStringLiteral("kareport: ") + *error);
        }
        return exitOutput;
    }
    if (!quiet && isEmpty && output.kind == OutputKind::Report) {
        printError(Xlate("kareport: the report is empty: \"%1\" was not written").arg(output.file));
    }
    return exitDone;
}

ExitStatus writeOutputs(UReportDoc &report, const std::vector<Output> &outputs, Progress &progress, bool quiet)
{
    ExitStatus status = exitDone;
    for (const Output &output : outputs) {
        if (isInterrupted()) {
            return stoppedBefore(output);
        }
        if (output.kind == OutputKind::Pdf && makesNoPage(report)) {
            // The library makes a document without a page of it, which readers refuse.
            printError(Xlate("kareport: the report is empty, and a PDF has a page at least: \"%1\" was not written")
                           .arg(output.file));
            status = std::max(status, exitInput);
            continue;
        }
        if (!output.isStandardOutput()) {
            progress.begin(Xlate("Writing %1").arg(output.file), 0);
        }
        QStringList warnings;
        const auto error = writeOutput(report, output, progress, warnings);
        if (error && error->isEmpty()) {
            endByClosedReader();
        }
        progress.finish();
        if (error && isInterrupted()) {
            return stoppedBefore(output);
        }
        for (const QString &warning : quiet ? QStringList() : warnings) {
            printError(Xlate("kareport: warning: \"%1\": %2").arg(output.file, warning));
        }
        status = std::max(status, sayWritten(output, error, report.IsEmpty(), quiet));
    }
    return status;
}

} // namespace kareport
