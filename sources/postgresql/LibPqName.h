#pragma once

class QLibrary;

namespace kareport
{

/// Names the client library of PostgreSQL to what loads it.
void setLibPqName(QLibrary &library);

} // namespace kareport
