#pragma once

#include "OutputKind.h"
#include "Progress.h"
#include "UReportDoc.h"

#include <optional>

namespace kareport
{

/// Writes a report to where an output says. @param warnings  receives what a reader of the output should know
/// @return what went wrong; nothing when it was written
std::optional<QString> writeOutput(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings);

} // namespace kareport
