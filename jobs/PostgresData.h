#pragma once

#include "DataKind.h"

namespace kareport
{

/// Data sets with the key "postgresql": a query of a PostgreSQL database.
DataKind postgresDataKind();

} // namespace kareport
