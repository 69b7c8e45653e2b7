#pragma once

#include "KaReportExport.h"

#include <QString>
#include <QStringList>

namespace kareport
{

/// The languages that texts are translated into, such as "de"; English is always there.
KAREPORT_EXPORT QStringList translatedLanguages();

/// A text as each of the languages has it, English first. @param text  as for `Xlate`
KAREPORT_EXPORT QStringList inAllLanguages(const char *text);

/// Shows texts in a language from now on, those of Qt's own windows included where Qt has them. Windows that are open keep
/// theirs.
/// @param language  such as "de" or "de_AT"; empty for the system's
/// @return the language that holds; "en" where there is no translation into the one asked for
KAREPORT_EXPORT QString setLanguage(const QString &language);

} // namespace kareport
