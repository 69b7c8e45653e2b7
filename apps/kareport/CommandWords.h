#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace kareport
{

/// What an option or an argument takes, for completion.
enum class ArgumentKind
{
    Flag, ///< an option that takes nothing
    Text, ///< what only the user knows
    File,
    Folder,
    TemplateFile,
    JobFile,
    CheckedFile, ///< a template or a job
    SavedReport,
    ViewedFile, ///< what the desktop program opens
    OutputKind,
    TemplateName, ///< a template of the file of --template, or of the argument
    TableName,    ///< of that template
    BlockName,
    SetKey,  ///< KEY=VALUE of a job
    PageKey, ///< the same, of its page alone
    Delimiter,
    Decimal,
    Encoding,
    Shell,
    Command
};

/// An option, or an argument that is told by its place.
struct OptionWords
{
    QString longName;       ///< with its dashes; empty for an argument
    QString shortName = {}; ///< "-o"; empty for none
    QString valueName = {}; ///< as the help shows it; empty for a flag
    QString description = {};
    ArgumentKind kind = ArgumentKind::Flag;
    bool isRepeated = false; ///< can be given several times
};

/// A command with all that can be given to it.
struct CommandWords
{
    QString name;
    QString description;
    std::vector<OptionWords> options;
    std::vector<OptionWords> arguments;
};

/// The endings of the files of a kind, without their dots; empty for any file, and for what is not a file.
QStringList endingsOf(ArgumentKind kind);

/// The values of a kind that are always the same; empty where they depend on something else. Of KEY=VALUE, a key whose values are
/// not known ends with "=".
QStringList fixedValuesOf(ArgumentKind kind);

/// The names of the commands, or of all options of a command, short ones included.
QStringList commandNames(const std::vector<CommandWords> &commands);
QStringList optionNames(const CommandWords &command);
/// A command by its name; null for another word.
const CommandWords *findCommand(const std::vector<CommandWords> &commands, const QString &name);
/// An option by its long or its short name; null for another word.
const OptionWords *findOption(const CommandWords &command, const QString &name);

} // namespace kareport
