#pragma once

#include "Job.h"
#include "JsonNode.h"

#include <memory>

namespace kareport
{

/// Reads what a job's PDFs say of themselves. @return null where the job does not ask for it
std::shared_ptr<const Job::Pdf> readPdf(const JsonNode &node);

} // namespace kareport
