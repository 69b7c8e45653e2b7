#pragma once

#include "Commands.h"
#include "OutputKind.h"
#include "Progress.h"
#include "UReportDoc.h"

#include <optional>
#include <vector>

namespace kareport
{

/// Whether an output is made with fonts of the screen, which needs a running QGuiApplication.
bool needsFonts(const std::vector<Output> &outputs);

/// Says on standard error what went wrong with an output or, unless `quiet`, that an empty report makes no file.
ExitStatus sayWritten(const Output &output, const std::optional<QString> &error, bool isEmpty, bool quiet);

/// Writes a report to each of its outputs, and says on standard error what goes wrong and, unless `quiet`, what a reader
/// should know. An output that cannot be written does not keep the others from being written.
ExitStatus writeOutputs(UReportDoc &report, const std::vector<Output> &outputs, Progress &progress, bool quiet);

} // namespace kareport
