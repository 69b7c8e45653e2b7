#pragma once

#include "Commands.h"
#include "OutputKind.h"
#include "Progress.h"
#include "UReportDoc.h"

#include <vector>

namespace kareport
{

/// Whether an output is made with fonts of the screen, which needs a running QGuiApplication.
bool needsFonts(const std::vector<Output> &outputs);

/// Writes a report to each of its outputs, and says on standard error what goes wrong and, unless `quiet`, what a reader
/// should know. An output that cannot be written does not keep the others from being written.
ExitStatus writeOutputs(UReportDoc &report, const std::vector<Output> &outputs, Progress &progress, bool quiet);

} // namespace kareport
