#pragma once

#include "KaReportExport.h"

#include <QString>

/// The translation of a text in the current language, or the text itself where there is none. What follows "@@" is
/// a note for the translator and is never shown.
KAREPORT_EXPORT QString Xlate(const char *text);
