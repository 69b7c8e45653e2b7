#pragma once

#include "Job.h"
#include "JsonNode.h"

namespace kareport
{

/// Reads a job file's content. What is wrong with it fails the source; the job that comes back then is no use.
/// @param kindOtherwise  the kind of outputs whose names do not say it
Job readJob(JsonSource &source, std::optional<OutputKind> kindOtherwise = std::nullopt);

/// Reads the host's settings by their keys.
UJobSettings readSettings(const JsonNode &node);
/// Reads the units of a data set.
DataUnits readDataUnits(const JsonNode &node);

} // namespace kareport
