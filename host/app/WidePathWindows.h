#pragma once

#include <QString>

#include <string>

namespace kareport
{

/// A path as the functions of the system take it: absolute and of any length. The name of a device stays as it is.
std::wstring widePath(const QString &path);

} // namespace kareport
