#pragma once

#include "KaReportExport.h"

#include <QString>

/// The title that a program has until it sets another one, and the word that every title begins with.
inline constexpr QLatin1StringView baseApplicationTitle("TALVEN");

/// The host's title, which begins every page header: `baseApplicationTitle` unless a longer one was set.
KAREPORT_EXPORT QString GetApplicationTitle();

/// Sets a longer title. It must begin with `baseApplicationTitle`, by which a saved report is known when it is loaded.
/// @return false, and the title stays, for any other text
KAREPORT_EXPORT bool SetApplicationTitle(const QString &title);
