#pragma once

#include <QFile>
#include <QString>

namespace kareport
{

// Files in a folder that several users share, such as the system's folder for temporary files: a name that can be guessed
// may have been taken by another user, with a file of his own or with a link to one of ours.

/// Opens a new file for writing that only the user can read. What has the name already is never opened, followed or
/// replaced. @return false when there is something of that name, or no file can be made
bool openPrivateFile(QFile &file);

/// Replaces a file or a link by an empty file that only the user can read; what a link points to stays.
/// @return false when something of that name cannot be removed, or no file can be made
bool makePrivateFile(const QString &path);

/// Whether there is anything of that name, including a link that leads nowhere.
bool isNameTaken(const QString &path);

} // namespace kareport
