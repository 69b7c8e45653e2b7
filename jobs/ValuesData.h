#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "values": their rows are in the job.
DataKind valuesDataKind();

} // namespace kareport
