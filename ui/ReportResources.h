#pragma once

#include "KaReportExport.h"

#include <QIcon>
#include <QString>

namespace kareport
{

/// Numbers of the report window's commands and texts.
inline constexpr unsigned reportWindowTitle = 11001;
inline constexpr unsigned commandSaveReport = 11007;
inline constexpr unsigned commandShowReport = 11009;
inline constexpr unsigned commandPrintReport = 11011;
/// The toolbar of the report window.
inline constexpr unsigned reportToolBar = 11018;

/// The untranslated text of a number; empty for a number that has none.
KAREPORT_EXPORT const char *reportString(unsigned number);

/// The icon of a report command: drawn as lines in the colour of the text, so that it reads on light and dark at any size
/// and resolution. Null for a command that has none.
KAREPORT_EXPORT QIcon reportIcon(unsigned command);

} // namespace kareport
