#pragma once

#include <QString>

namespace kareport
{

/// Asks whether a file that another program has changed is loaded again.
/// @param hasUnsavedChanges  what is open of the file has changes that would be lost
bool askToLoadAgain(const QString &path, bool hasUnsavedChanges);

} // namespace kareport
