#pragma once

#include <QString>

namespace kareport
{

/// A text for a terminal: characters that would command it, end a line or turn the order of letters around, and so let a
/// name or a key pretend something, are written as \u001b. Names of files, keys of jobs and texts of templates are not ours.
QString visibleText(const QString &text);

/// Writes a line to standard output or standard error, as `visibleText`. A tab on standard output stays: it stands between
/// the columns of a list.
void printLine(const QString &line);
void printError(const QString &line);

} // namespace kareport
