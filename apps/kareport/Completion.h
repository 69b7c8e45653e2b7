#pragma once

#include "CommandWords.h"

#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// The shells that there is completion for.
enum class Shell
{
    Bash,
    Zsh,
    Fish
};

/// A shell by its name, such as "zsh"; nothing for another name.
std::optional<Shell> shellFromName(const QString &name);

/// The script that completes the command line of `kareport` in a shell: names of commands, options and their values; files of
/// the kinds that are expected; templates, tables and blocks by their names, which it asks `kareport templates` for.
QString completionScript(Shell shell, const std::vector<CommandWords> &commands);

QString bashCompletion(const std::vector<CommandWords> &commands);
QString zshCompletion(const std::vector<CommandWords> &commands);
QString fishCompletion(const std::vector<CommandWords> &commands);

} // namespace kareport
