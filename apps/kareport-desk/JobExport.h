#pragma once

#include "Progress.h"
#include "ReportRecipe.h"

#include <QString>
#include <QStringList>

namespace kareport
{

/// What a save dialog offers for the values of a report, as `SaveRequest::filter`.
QString exportFilter();

/// Writes the values of a report into a file of another program, by its ending: a workbook, a web page, or rows as data.
/// The job runs again for it, without its own outputs: what was typed into the report is not in the file.
/// @param warnings  receive what a reader of the file should know
/// @return what went wrong; empty when the file was written, or the work was stopped
QString exportJob(const ReportRecipe &recipe, const QString &file, Progress &progress, QStringList &warnings);

} // namespace kareport
