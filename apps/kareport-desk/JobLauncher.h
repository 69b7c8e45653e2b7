#pragma once

#include "Job.h"
#include "JobExport.h"
#include "JobNotes.h"

#include <QString>

class QWidget;
class UReportDoc;

namespace kareport
{

/// Whether a job is running now: its report must not be closed.
bool isJobRunning();

/// Runs a job file in the application, with a window that shows progress and can stop it.
/// @param error  receives what went wrong; empty when the job was stopped
/// @param notes  receive what the user should know of the report
/// @return the report, shown in its pane; null when it was not made
UReportDoc *launchJob(const QString &path, QWidget *parent, QString &error, JobNotes &notes);
/// The same with a data file and a template.
UReportDoc *launchTemplateJob(const TemplateJob &job, QWidget *parent, QString &error, JobNotes &notes);

/// Writes the values of a report into a file, as `exportJob` does, with a window that shows progress and can stop it.
/// @return as `exportJob`
QString launchExport(const JobOrigin &origin, const QString &file, QWidget *parent, QStringList &warnings);

} // namespace kareport
