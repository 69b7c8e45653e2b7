#include "CommandWords.h"

#include "OutputKind.h"
#include "SetKeys.h"
#include "TextEncoding.h"

#include <algorithm>

namespace kareport
{

namespace
{

QStringList listOf(const char *words)
{
    return QString::fromLatin1(words).split(u' ');
}

} // namespace

QStringList endingsOf(ArgumentKind kind)
{
    switch (kind) {
    case ArgumentKind::TemplateFile: return listOf("xml");
    case ArgumentKind::JobFile: return listOf("json");
    case ArgumentKind::CheckedFile: return listOf("xml json");
    case ArgumentKind::SavedReport: return listOf("rep rtf txt");
    case ArgumentKind::ViewedFile: return listOf("rep rtf json xml");
    default: return {};
    }
}

QStringList fixedValuesOf(ArgumentKind kind)
{
    switch (kind) {
    case ArgumentKind::OutputKind: return outputKindNames().split(QStringLiteral(", "));
    case ArgumentKind::SetKey: return setKeys(QString());
    case ArgumentKind::PageKey: return setKeys(QStringLiteral("page."));
    case ArgumentKind::Delimiter: return listOf("auto tab whitespace");
    case ArgumentKind::Decimal: return listOf(". ,");
    case ArgumentKind::Encoding: return textEncodingKeys();
    case ArgumentKind::Shell: return listOf("bash zsh fish");
    default: return {};
    }
}

QStringList commandNames(const std::vector<CommandWords> &commands)
{
    QStringList names;
    for (const CommandWords &command : commands) {
        names.append(command.name);
    }
    return names;
}

QStringList optionNames(const CommandWords &command)
{
    QStringList names;
    for (const OptionWords &option : command.options) {
        names.append(option.longName);
        if (!option.shortName.isEmpty()) {
            names.append(option.shortName);
        }
    }
    return names;
}

const CommandWords *findCommand(const std::vector<CommandWords> &commands, const QString &name)
{
    const auto found = std::find_if(commands.begin(), commands.end(),
                                    [&name](const CommandWords &command) { return command.name == name; });
    return found != commands.end() ? &*found : nullptr;
}

const OptionWords *findOption(const CommandWords &command, const QString &name)
{
    const auto found = std::find_if(command.options.begin(), command.options.end(), [&name](const OptionWords &option) {
        return option.longName == name || (!option.shortName.isEmpty() && option.shortName == name);
    });
    return found != command.options.end() ? &*found : nullptr;
}

} // namespace kareport
