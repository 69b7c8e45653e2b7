#pragma once

#include "LibPq.h"

#include <QString>

#include <memory>

namespace kareport
{

/// An answer of a server.
using PostgresResult = std::unique_ptr<PGresult, void (*)(PGresult *)>;

/// An answer that libpq has given, which may be null.
PostgresResult resultOf(PGresult *result);
/// No answer.
PostgresResult noResult();

/// A text of libpq in one line.
QString lineOf(const char *text);
/// What the server says is wrong, with the place in the query.
QString reasonOf(const PGresult *result);

} // namespace kareport
