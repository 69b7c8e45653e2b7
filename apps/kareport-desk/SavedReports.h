#pragma once

#include <QString>

class UReportDoc;

namespace kareport
{

/// Why a file cannot be opened; empty when it may be tried. Reading a pipe or a device might never end.
QString whyNotOpened(const QString &path);
/// Opens a saved report in a pane. The windows answer while a long file is read: the report is there once it has been.
/// @param isStopped  receives whether the user has stopped it; may be null
/// @return null when it cannot be opened or was stopped
UReportDoc *openSavedReport(const QString &path, bool *isStopped = nullptr);
/// Replaces what a report holds by its file. @param isStopped  as above
/// @return false, with the report as it was, when the file cannot be read or that was stopped; the report may have been
/// closed meanwhile
bool reloadSavedReport(UReportDoc &report, bool *isStopped = nullptr);

} // namespace kareport
