#pragma once

#include <QString>

class UReportDoc;

namespace kareport
{

/// Opens a saved report in a pane. @return null when it cannot be opened
UReportDoc *openSavedReport(const QString &path);
/// Replaces what a report holds by its file. @return false, with the report as it was, when it
/// cannot be opened
bool reloadSavedReport(UReportDoc &report);

} // namespace kareport
