#pragma once

#include "DataKind.h"

#include <vector>

namespace kareport
{

/// The kinds of data sets that a job may have. This is the only list of them: the reader of jobs, the messages about keys
/// and the opening of data all ask here.
const std::vector<DataKind> &dataKinds();

} // namespace kareport
