#pragma once

#include "CommandOptions.h"

#include <CLI/CLI.hpp>

namespace kareport
{

/// What is wrong with a command line that could not be parsed: a sentence that names the word, and the nearest one that is
/// known.
QString parsingMistake(const CommandLine &line, const CLI::ParseError &error);

/// What is wrong with a word that is not the name of a command.
QString unknownCommand(const QString &word, const QStringList &names);

} // namespace kareport
