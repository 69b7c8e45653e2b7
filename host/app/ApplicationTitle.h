#pragma once

#include "KaReportExport.h"

#include <QString>

/// The host's title, which begins every page header: "TALVEN" unless a longer one was set.
KAREPORT_EXPORT QString GetApplicationTitle();

/// Sets a longer title. It must begin with "TALVEN", the word by which a saved report is known when it is loaded.
/// @return false, and the title stays, for any other text
KAREPORT_EXPORT bool SetApplicationTitle(const QString &title);
