#include "Completion.h"

namespace kareport
{

namespace
{

constexpr const char *zshFunctions = R"sh(#compdef kareport
# Completion of kareport for zsh. Made by "kareport completion zsh".

# Takes the names of the templates of a file, or with "table" or "block" those of a template's parts.
_kareport_names()
{
    local file=${(Q)opt_args[--template]:-${(Q)opt_args[-t]:-${(Q)line[1]}}} name=${(Q)opt_args[--name]:-${(Q)opt_args[-n]}}
    local kind=$argv[-1] # after what _arguments says of the group
    local -a names
    if [[ $kind == template ]]; then
        names=("${(@f)$(kareport templates ${~file} 2> /dev/null)}")
        names=("${(@)names%%$'\t'*}")
    else
        names=("${(@f)$(kareport templates ${~file} --name $name 2> /dev/null)}")
        names=("${(@M)names:#$kind *}")
        names=("${(@)names#$kind }")
        names=("${(@)names% \(dictionary *}")
    fi
    compadd "${(@)argv[1,-2]}" -a names
}

_kareport()
{
    local curcontext=$curcontext state line
    local -A opt_args
)sh";

/// A text within single quotes.
QString inZshQuotes(QString text)
{
    return u'\'' + text.replace(u'\'', QStringLiteral("'\\''")) + u'\'';
}

/// A text in an entry of _arguments or _describe, where some characters separate its parts.
QString escaped(const QString &text)
{
    QString safe;
    for (const QChar character : text) {
        if (QStringView(u"\\:[]()").contains(character)) {
            safe += u'\\';
        }
        safe += character;
    }
    return safe;
}

/// What completes a value of a kind; a blank where only the user knows.
QString completingInZsh(ArgumentKind kind, const QStringList &commands)
{
    switch (kind) {
    case ArgumentKind::Flag: return {};
    case ArgumentKind::Text: return QStringLiteral(" ");
    case ArgumentKind::File: return QStringLiteral("_files");
    case ArgumentKind::Folder: return QStringLiteral("_files -/");
    case ArgumentKind::TemplateName: return QStringLiteral("_kareport_names template");
    case ArgumentKind::TableName: return QStringLiteral("_kareport_names table");
    case ArgumentKind::BlockName: return QStringLiteral("_kareport_names block");
    case ArgumentKind::Command: return QStringLiteral("(%1)").arg(commands.join(u' '));
    default: break;
    }
    const QStringList endings = endingsOf(kind);
    if (!endings.isEmpty()) {
        return QStringLiteral("_files -g \"*.(#i)(%1)(-.)\"").arg(endings.join(u'|'));
    }
    const QStringList values = fixedValuesOf(kind);
    if (kind == ArgumentKind::SetKey || kind == ArgumentKind::PageKey) {
        return QStringLiteral("compadd -S \"\" -- %1").arg(values.join(u' '));
    }
    return QStringLiteral("(%1)").arg(values.join(u' '));
}

/// An option for _arguments, with its value after it or after a "=".
QString optionEntry(const OptionWords &option, const QStringList &commands)
{
    const bool takesValue = option.kind != ArgumentKind::Flag;
    QString text = u'[' + escaped(option.description) + u']';
    if (takesValue) {
        text += u':' + escaped(option.valueName) + u':' + completingInZsh(option.kind, commands);
    }
    const QString longName = option.longName + (takesValue ? QStringLiteral("=") : QString());
    if (option.shortName.isEmpty()) {
        return inZshQuotes((option.isRepeated ? QStringLiteral("*") : QString()) + longName + text);
    }
    const QString shortName = option.shortName + (takesValue ? QStringLiteral("+") : QString());
    const QString before =
        option.isRepeated ? QStringLiteral("*") : QStringLiteral("(%1 %2)").arg(option.shortName, option.longName);
    return inZshQuotes(before) + u'{' + shortName + u',' + longName + u'}' + inZshQuotes(text);
}

QString argumentEntry(const OptionWords &argument, std::size_t number, const QStringList &commands)
{
    const QString place = argument.isRepeated ? QStringLiteral("*") : QString::number(number + 1);
    return inZshQuotes(place + u':' + escaped(argument.valueName) + u':' + completingInZsh(argument.kind, commands));
}

QString caseOf(const CommandWords &command, const QStringList &commands)
{
    QString text = QStringLiteral("    %1)\n        _arguments -s -S").arg(command.name);
    const QString nextLine = QStringLiteral(" \\\n            ");
    for (const OptionWords &option : command.options) {
        text += nextLine + optionEntry(option, commands);
    }
    for (std::size_t i = 0; i < command.arguments.size(); ++i) {
        text += nextLine + argumentEntry(command.arguments[i], i, commands);
    }
    return text + QStringLiteral("\n        ;;\n");
}

} // namespace

QString zshCompletion(const std::vector<CommandWords> &commands)
{
    QString script = QString::fromUtf8(zshFunctions);
    const QStringList names = commandNames(commands);
    script += QStringLiteral("    local -a verbs=(\n");
    for (const CommandWords &command : commands) {
        script += QStringLiteral("        ") + inZshQuotes(command.name + u':' + escaped(command.description)) + u'\n';
    }
    script += QStringLiteral("    )\n"
                             "    _arguments -C '(- : *)'{-h,--help}'[Print this help message and exit]' \\\n"
                             "        '(- : *)--version[Print the version and exit]' '1: :->command' '*:: :->rest'\n"
                             "    if [[ $state == command ]]; then\n"
                             "        _describe -t commands command verbs\n"
                             "        return\n"
                             "    fi\n"
                             "    [[ $state == rest ]] || return\n"
                             "    case $words[1] in\n");
    for (const CommandWords &command : commands) {
        script += caseOf(command, names);
    }
    return script + QStringLiteral("    esac\n}\n\n"
                                   "# Loaded by its name it is the function itself; sourced it says so.\n"
                                   "if [[ $funcstack[1] == _kareport ]]; then\n"
                                   "    _kareport \"$@\"\n"
                                   "else\n"
                                   "    compdef _kareport kareport\n"
                                   "fi\n");
}

} // namespace kareport
