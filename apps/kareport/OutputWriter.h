#pragma once

#include "OutputKind.h"
#include "UReportDoc.h"

#include <optional>

namespace kareport
{

/// Writes a report to where an output says. @return what went wrong; nothing when it was written
std::optional<QString> writeOutput(UReportDoc &report, const Output &output);

} // namespace kareport
