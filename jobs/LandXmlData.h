#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "landxml": lists that are read of a LandXML file.
DataKind landXmlDataKind();

} // namespace kareport
