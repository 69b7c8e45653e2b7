#pragma once

#include "Commands.h"
#include "JobOutputs.h"
#include "OutputFolders.h"
#include "ResultOutputs.h"

#include <vector>

namespace kareport
{

/// Says on standard error what went wrong with an output or, unless `quiet`, that an empty report makes no file.
ExitStatus sayWritten(const Output &output, const OutputResult &result, bool isEmpty, bool quiet,
                      const OutputFolders &folders);

/// Writes a report to each of its outputs, and reports on standard error what goes wrong and, unless `quiet`, what a reader
/// should know. An output that cannot be written does not keep the others from being written.
/// @param notes    receive the characters that an output does not show; null where they are not needed
/// @param results  of the run; null where no output is made of them
ExitStatus writeOutputs(UReportDoc &report, const std::vector<Output> &outputs, Progress &progress, bool quiet,
                        const OutputFolders &folders, JobNotes *notes = nullptr,
                        const ResultOutputs *results = nullptr);

} // namespace kareport
