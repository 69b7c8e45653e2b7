#pragma once

#include "OutputKind.h"
#include "SaveAs.h"

#include <QStringList>

class QWidget;
class UReportDoc;

namespace kareport
{

/// The question for the file that a report is exported into. All kinds are offered, the wanted one first: PDF, rich text or
/// plain text.
SaveRequest exportRequest(UReportDoc &report, OutputKind kind, const QString &folder);

/// Writes a report as it is now into a file of another kind, by the ending of its name. The report keeps its own file and its
/// changes.
/// @param warnings  receive what the file does not have of the report
/// @return what went wrong; empty when the file was written
QString exportReport(UReportDoc &report, const SaveChoice &choice, QStringList &warnings);

} // namespace kareport
