#pragma once

#include "Job.h"
#include "JsonSource.h"
#include "Progress.h"
#include "ReportRecipe.h"

#include <QString>
#include <QStringList>

#include <cstddef>
#include <memory>
#include <vector>

namespace kareport
{

/// What a save dialog offers for the values of a report, as `SaveRequest::filter`.
QString exportFilter();

/// Writes the values of a report into a file of another program, by its ending: a workbook, a web page, or rows as data.
/// The job runs again for it, without its own outputs: what was typed into the report is not in the file.
class JobExport
{
public:
    /// Reads the job. @return what went wrong; empty when the file may be written
    QString open(const ReportRecipe &recipe, const QString &file);
    /// What the file may have the rows of, where it has those of one table or block and the job does not say which: its name,
    /// with that of its data. Empty where there is nothing to choose.
    const QStringList &choices() const { return choices_; }
    /// Chooses one of them, by its place.
    void choose(std::size_t choice);
    /// Writes the file. Everything stays as it was where that fails or is stopped.
    /// @param warnings  receive what a reader of the file should know
    /// @return what went wrong; empty when the file was written, or the work was stopped
    QString write(Progress &progress, QStringList &warnings) const;

private:
    void findChoices();

    std::unique_ptr<JsonSource> source_;
    std::unique_ptr<Job> job_;
    std::vector<Output> own_;        ///< outputs of the job of the kind that is written
    std::vector<std::size_t> steps_; ///< of the choices
    QStringList choices_;
};

} // namespace kareport
