#pragma once

#include "Folders.h"
#include "Job.h"
#include "JsonSource.h"

#include <optional>

namespace kareport
{

/// What a job is made with where it does not say otherwise.
struct JobDefaults
{
    UJobSettings settings = {};
    Job::Page page = {};
    std::optional<OutputKind> outputKind = std::nullopt; ///< of outputs whose names do not say it
    QString templateFolder = GetLibraryDir(false); ///< has the template files that are not in the job's own folder
};

/// The key of a paper in the page of a job. That of the country is one of the others by then.
QString paperKey(PaperSize paper);

/// Reads a job file's content. @return the first thing that is wrong with it
Expected<Job> readJob(const JsonSource &source, const JobDefaults &defaults = {});

} // namespace kareport
