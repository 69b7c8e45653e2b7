#pragma once

#include "Job.h"

namespace kareport
{

/// Whether every output of a job is a file that was written later than all that the job is made of was changed: the job
/// file, its template file and its data files. A file with the very time of an output counts as changed after it, and a
/// job with standard output among its outputs is never up to date.
/// @param path  the job file; empty for a job that stands in no file
bool isUpToDate(const Job &job, const QString &path);

} // namespace kareport
