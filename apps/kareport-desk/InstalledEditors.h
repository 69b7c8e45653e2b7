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

/// The programs with a window of their own that say that they open plain or rich text, by their names.
/// @param folders  where programs are described (*.desktop); empty for the system's
std::vector<InstalledEditor> installedEditors(const QStringList &folders = {});

} // namespace kareport
