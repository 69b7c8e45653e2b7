#pragma once

#include <QByteArray>
#include <QString>

#include <filesystem>

namespace kareport
{

/// The name of a file for a library that opens it by bytes. Where such names lack characters, as in the code page of a
/// Windows, it is another name of the same file, as far as the system gives one.
QByteArray pathForLibrary(const QString &path);
/// A path for the C++ library.
std::filesystem::path standardPath(const QString &path);
/// A path out of a list in a file, or what the program was given on its command line.
QString textOfSystem(const QByteArray &bytes);

} // namespace kareport
