#pragma once

#include <QString>

namespace kareport
{

/// The file that a name leads to, with every link on the way followed. The file itself need not exist. A name that leads
/// nowhere is its own target: what is wrong with it shows when it is opened. A link of another user in a folder that all
/// write to may not be followed.
/// @param error  receives a sentence when a link on the way may not be followed; may be null
/// @return empty when a link may not be followed
QString linkTarget(const QString &path, QString *error = nullptr);

} // namespace kareport
