#pragma once

class UReportDoc;

namespace kareport
{

/// Defers the closing of a report because the program exits, until it is deleted or the exit is cancelled
/// (`noteExitCancelled`).
void deferCloseForExit(UReportDoc &report);

/// Notes that a report whose closing was deferred has been asked to close.
void noteCloseAsked(const UReportDoc &report);

/// A report that is destroyed takes no further part in an exit.
void forgetExit(const UReportDoc &report);

} // namespace kareport
