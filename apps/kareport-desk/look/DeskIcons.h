#pragma once

#include <QIcon>

namespace kareport
{

/// The icon of a command of the main window, by its number; null for one that has none. They are of one make with those of
/// the report window, and read on light and dark.
QIcon deskIcon(unsigned command);

} // namespace kareport
