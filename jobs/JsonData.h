#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "json": JSON files with a list of objects, or an object a line.
DataKind jsonDataKind();

} // namespace kareport
