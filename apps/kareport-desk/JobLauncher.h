#pragma once

#include "JobExport.h"
#include "JobNotes.h"
#include "JobWork.h"
#include "ReportRecipe.h"

#include <QString>
#include <QStringList>

#include <cstddef>
#include <functional>
#include <optional>

class QWidget;
class UReportDoc;

namespace kareport
{

/// What is asked and told while a report is made.
struct LaunchHooks
{
    /// Is told the files that the report is made of, before they are read; may be empty.
    std::function<void(const QStringList &files)> aboutToRead = {};
    /// Of a report that is made again: asked, when all is there, whether it may take the place of what the report holds. May
    /// be empty.
    std::function<bool()> mayReplace = {};
};

/// What became of a job that was run.
struct LaunchResult
{
    QString error;  ///< what went wrong; empty when the job was stopped
    JobNotes notes; ///< what the user should know of the report
    QString title;  ///< that the job or the template gives the report
};

/// Runs a job in the application, with a window that shows progress and can stop it.
/// @return the report, shown in its pane; null when it was not made
UReportDoc *launchJob(const ReportRecipe &recipe, QWidget *parent, LaunchResult &result, const LaunchHooks &hooks = {});

/// Makes a report again, in the same way. Its windows stay, and so do the places in them.
/// @param result  has the title that the report was made with last
/// @return false, with the report as it was, when it was not made, or not put into its place; it may have been closed
///         meanwhile
bool launchAgain(UReportDoc &report, const ReportRecipe &recipe, QWidget *parent, LaunchResult &result,
                 const LaunchHooks &hooks = {});

/// Asks which of several tables a file has the rows of. @return its place; nothing for none
using AskTable = std::function<std::optional<std::size_t>(const QStringList &tables)>;

/// What became of values that were written for another program.
struct ExportResult
{
    QString error;        ///< what went wrong; empty when the work was stopped
    QStringList warnings; ///< what a reader of the file should know
    bool isWritten = false;
};

/// Writes the values of a report into a file, as `JobExport` does, with a window that shows progress and can stop it.
ExportResult launchExport(const ReportRecipe &recipe, const QString &file, QWidget *parent, const AskTable &askTable);

} // namespace kareport
