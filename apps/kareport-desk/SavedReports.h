#pragma once

#include <QString>

class UReportDoc;

namespace kareport
{

/// Why a file cannot be opened; empty when it may be tried. Reading a pipe or a device might never end.
QString whyNotOpened(const QString &path);
/// Opens a saved report in a pane. @return null when it cannot be opened
UReportDoc *openSavedReport(const QString &path);
/// Replaces what a report holds by its file. @return false, with the report as it was, when it
/// cannot be opened
bool reloadSavedReport(UReportDoc &report);

} // namespace kareport
