#pragma once

#include <QString>

namespace kareport
{

/// A text for a terminal: characters that would command it, end a line or turn the order of letters around, and so let a
/// name or a key pretend something, are written as \u001b. Names of files, keys of jobs and texts of templates are not ours.
QString visibleText(const QString &text);

} // namespace kareport
