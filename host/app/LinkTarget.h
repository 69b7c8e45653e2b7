#pragma once

#include <QString>

namespace kareport
{

/// Whether a link may be followed: not one of another user, which anyone can put into a folder that all write to, such
/// as the system's folder for temporary files, under a name that a program is going to write. The rule is that of Linux's
/// protected_symlinks, which many systems have switched off.
/// @param folderMode  permissions and kind of the folder that the link is in
/// @param user        who follows it
bool mayFollowLink(unsigned folderMode, unsigned folderOwner, unsigned linkOwner, unsigned user);

/// The file that a name leads to, with every link on the way followed. The file itself need not exist. A name that leads
/// nowhere is its own target: what is wrong with it shows when it is opened.
/// @param error  receives a sentence when a link on the way may not be followed; may be null
/// @return empty when a link may not be followed
QString linkTarget(const QString &path, QString *error = nullptr);

} // namespace kareport
