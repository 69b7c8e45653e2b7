#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace kareport
{

/// A program that opens texts.
struct InstalledEditor
{
    QString name; ///< as its maker calls it, in the user's language
    QString path; ///< full path
};

/// The programs with a window of their own that the system knows to open plain or rich text, by their names.
/// @param folders  where programs are described, on systems that have such descriptions (*.desktop); empty for the system's
std::vector<InstalledEditor> installedEditors(const QStringList &folders = {});

/// Where a user begins to look for programs that are not in the list.
QString programsFolder();

} // namespace kareport
