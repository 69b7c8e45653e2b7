#pragma once

#include <QString>

namespace kareport
{

/// The name by which a device or a pipe is opened; empty for a file, a folder, and what is not there.
QString devicePath(const QString &path);

} // namespace kareport
