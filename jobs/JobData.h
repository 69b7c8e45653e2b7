#pragma once

#include "FileBytes.h"
#include "Job.h"
#include "JsonSource.h"
#include "Progress.h"
#include "RowList.h"
#include "ValueParser.h"

#include <QHash>
#include <QString>

#include <functional>
#include <memory>

namespace kareport
{

/// The data sets of a job, opened as rows for the steps that write them.
class JobData
{
public:
    /// @param source     the job file, for the values in it and for the places of errors
    /// @param progress   shows how far a data file has been read
    /// @param isStopped  is asked now and then; its true ends the rows
    JobData(const Job &job, const JsonSource &source, Progress &progress, std::function<bool()> isStopped)
        : job_(job), source_(source), progress_(progress), isStopped_(std::move(isStopped))
    {}

    /// Opens a data set that the job has.
    /// @param findVariable  types the rows
    /// @param firstOnly     whether one row is enough where the others cost nothing to leave out
    Expected<std::unique_ptr<RowList>> open(const QString &name, const FindVariable &findVariable, bool firstOnly);

    /// What is wrong with a data set that has no row.
    /// @param step  needs one
    InputError noRow(const QString &name, const JsonPath &step) const;

private:
    Expected<std::unique_ptr<RowList>> openCsv(const QString &name, const Job::DataSet &set,
                                               const FindVariable &findVariable);

    const Job &job_;
    const JsonSource &source_;
    Progress &progress_;
    std::function<bool()> isStopped_;
    QHash<QString, std::shared_ptr<const FileBytes>> files_; ///< by their paths
};

} // namespace kareport
