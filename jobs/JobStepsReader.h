#pragma once

#include "Job.h"
#include "JsonNode.h"

#include <vector>

namespace kareport
{

/// Reads the steps of a job. What is wrong with one fails the node.
/// @param job  has the template and the data sets that steps may name
std::vector<Job::Step> readSteps(const JsonNode &node, const Job &job);

} // namespace kareport
