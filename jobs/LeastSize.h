#pragma once

#include "Job.h"

#include <QtGlobal>

#include <optional>

class UReportDoc;

namespace kareport
{

/// The bytes that the report of a job has at least, as plain text. Lines of which the job says how many there are count: a
/// short job can ask for very many. What its data becomes is not known before.
qint64 leastSize(const Job &job);
/// The bytes that a report has at least, as far as it has been written: a line end of it may become one byte.
qint64 leastSize(const UReportDoc &report);

/// The largest size that all outputs of a job may have; nothing when each may have any.
std::optional<qint64> sizeLimit(const Job &job);
/// Whether a report of so many bytes at least is larger than an output of its job may be.
bool isTooLarge(const Job &job, qint64 leastBytes);

} // namespace kareport
