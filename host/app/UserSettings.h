#pragma once

#include <QSettings>

#include <memory>

namespace kareport
{

/// The user's own preferences, in the file where the system's programs keep theirs.
std::unique_ptr<QSettings> userSettings();

} // namespace kareport
