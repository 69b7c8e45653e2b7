#pragma once

#include "Job.h"
#include "JsonNode.h"

namespace kareport
{

/// What a job is made with where it does not say otherwise.
struct JobDefaults
{
    UJobSettings settings;
    Job::Page page;
};

/// Reads a job file's content. What is wrong with it fails the source; the job that comes back then is no use.
/// @param kindOtherwise  the kind of outputs whose names do not say it
/// @param defaults       hold where the job sets nothing else
Job readJob(JsonSource &source, std::optional<OutputKind> kindOtherwise = std::nullopt,
            const JobDefaults &defaults = {});

/// Reads the host's settings by their keys. @param settings  those whose keys are not given
UJobSettings readSettings(const JsonNode &node, UJobSettings settings = {});
/// Reads the units of a data set.
DataUnits readDataUnits(const JsonNode &node);

} // namespace kareport
