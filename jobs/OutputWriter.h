#pragma once

#include "OutputKind.h"
#include "Progress.h"
#include "UReportDoc.h"

#include <functional>
#include <optional>

namespace kareport
{

/// Puts a file into an output's place in one step. @param problem  what `write` found wrong, if it says so
/// @return what went wrong; nothing when it was written
std::optional<QString> replaceOutput(const Output &output, const std::function<bool(QIODevice &)> &write,
                                     const QString &problem = QString());

/// Writes a report to where an output says. @param warnings  receives what a reader of the output should know
/// @return what went wrong, empty when nobody reads standard output any more; nothing when it was written
std::optional<QString> writeOutput(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings);

} // namespace kareport
