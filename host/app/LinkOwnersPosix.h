#pragma once

namespace kareport
{

/// Whether a link may be followed: not one of another user, which anyone can put into a folder that all write to, such
/// as the system's folder for temporary files, under a name that a program is going to write. The rule is that of Linux's
/// protected_symlinks, which many systems have switched off.
/// @param folderMode  permissions and kind of the folder that the link is in
/// @param user        who follows it
bool mayFollowLink(unsigned folderMode, unsigned folderOwner, unsigned linkOwner, unsigned user);

} // namespace kareport
