#pragma once

#include "DataKind.h"
#include "Job.h"
#include "JsonSource.h"
#include "Progress.h"
#include "RowList.h"

#include <QString>

#include <functional>
#include <memory>

namespace kareport
{

/// The data sets of a job, opened as rows for the steps that write them.
class JobData
{
public:
    /// Finds the variables of a dictionary, for numbers in the given units.
    using VariablesIn = std::function<Variables(const DataUnits &)>;

    /// @param source     the job file, for the values in it and for the places of errors
    /// @param progress   shows how far a data file has been read
    /// @param isStopped  is asked now and then; its true ends the rows
    JobData(const Job &job, const JsonSource &source, Progress &progress, std::function<bool()> isStopped)
        : job_(job), source_(source), progress_(progress), isStopped_(std::move(isStopped))
    {}

    /// Opens a data set that the job has.
    /// @param firstOnly  whether one row is enough where the others cost nothing to leave out
    Expected<std::unique_ptr<RowList>> open(const QString &name, const VariablesIn &variablesIn, bool firstOnly);

    /// What is wrong with a data set that has no row.
    /// @param step  needs one
    InputError noRow(const QString &name, const JsonPath &step) const;

private:
    const Job &job_;
    const JsonSource &source_;
    Progress &progress_;
    std::function<bool()> isStopped_;
    DataFiles files_;
};

} // namespace kareport
