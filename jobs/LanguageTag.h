#pragma once

#include <QString>

namespace kareport
{

/// Whether a text has the form of a language tag such as "de" or "pt-BR": parts of letters and digits with hyphens between,
/// each of 1 to 8 characters, the first of letters alone.
bool isLanguageTag(const QString &text);

} // namespace kareport
