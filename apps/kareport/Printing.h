#pragma once

#include <QString>

namespace kareport
{

/// A text for a terminal: characters that would control it, end a line or reverse the order of letters, and so could fake a
/// name or a key, are written as \u001b. Names of files, keys of jobs and texts of templates come from outside.
QString visibleText(const QString &text);

/// Writes a line to standard output or standard error, as `visibleText`. A tab on standard output stays: it separates
/// the columns of a list.
void printLine(const QString &line);
void printError(const QString &line);

} // namespace kareport
