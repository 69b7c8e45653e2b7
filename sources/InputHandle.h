#pragma once

#include <QString>
#include <QtGlobal>

#include <cstddef>

namespace kareport
{

/// Opens a file, a pipe or a device for reading. Waiting for a pipe's writer ends when the program is interrupted.
/// @return a descriptor; below 0 when it fails, and `errno` says why
int openForReading(const QString &path);
/// A descriptor of its own for what is the program's standard input.
int openStandardInput();
/// Whether what is read comes from the beginning of something that has a size.
bool isAtStart(int handle);
/// @return the bytes that were read, 0 at the end, and below 0 when reading fails or the program is interrupted
qint64 readSome(int handle, char *to, std::size_t most);

} // namespace kareport
