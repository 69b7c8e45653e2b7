#pragma once

#include <QString>

namespace kareport
{

/// Tells files apart as the system does: two names have one identity when what is written to the one is read from the other,
/// whether through links, another path to the same folder, or letters of another case where the file system does not
/// tell them apart. A file that is not there yet is one already.
/// @return empty for what is not a file (a pipe, a device) and so loses nothing when it is written to twice
QString fileIdentity(const QString &path);

/// The file that standard output goes to; empty when it is none.
QString standardOutputIdentity();

} // namespace kareport
