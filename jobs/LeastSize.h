#pragma once

#include "Job.h"

#include <QtGlobal>

namespace kareport
{

/// The bytes that the report of a job has at least, as plain text. Lines of which the job says how many there are count: a
/// short job can ask for very many. What its data becomes is not known before.
qint64 leastSize(const Job &job);

} // namespace kareport
