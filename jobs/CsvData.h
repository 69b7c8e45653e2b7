#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "csv": text files of rows and cells.
DataKind csvDataKind();

} // namespace kareport
