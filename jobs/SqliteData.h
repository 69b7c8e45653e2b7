#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "sqlite": a table or a query of a SQLite database, a GeoPackage among them.
DataKind sqliteDataKind();

} // namespace kareport
