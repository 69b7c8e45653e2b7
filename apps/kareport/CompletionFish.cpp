#include "Completion.h"

namespace kareport
{

namespace
{

constexpr const char *fishFunctions = R"sh(# Completion of kareport for fish. Made by "kareport completion fish".

# Whether the command is one of those given; without any, whether there is none yet.
function __kareport_command_is
    set -l words (commandline -opc)
    set -e words[1]
    for word in $words
        string match -q -- '-*' $word; and continue
        contains -- $word $argv
        return
    end
    test (count $argv) -eq 0
end

# Prints the value that one of some options has on the command line.
function __kareport_value
    set -l words (commandline -opc)
    for i in (seq (count $words))
        for option in $argv
            if test "$words[$i]" = "$option"; and test $i -lt (count $words)
                echo $words[(math $i + 1)]
                return
            else if string match -q -- "$option=*" "$words[$i]"
                string replace -- "$option=" '' "$words[$i]"
                return
            end
        end
    end
end

# Prints the template file of the command line: the option's, or the argument of "kareport templates".
function __kareport_template
    if __kareport_command_is templates
        set -l words (commandline -opc)
        for word in $words[3..]
            if not string match -q -- '-*' $word
                echo $word
                return
            end
        end
    else
        __kareport_value -t --template
    end
end

function __kareport_template_names
    set -l template (__kareport_template)
    test -n "$template"; and kareport templates $template 2>/dev/null
end

# Prints the tables or the blocks of the template.
function __kareport_parts
    set -l template (__kareport_template)
    test -n "$template"
    and kareport templates $template --name (__kareport_value -n --name; or echo '') 2>/dev/null |
        string replace -rf "^$argv[1] (.*) \(dictionary .*\)\$" '$1'
end

complete -c kareport -f
complete -c kareport -n __kareport_command_is -l help -s h -d 'Print this help message and exit'
complete -c kareport -n __kareport_command_is -l version -d 'Print the version and exit'
)sh";

QString inFishQuotes(const QString &text)
{
    QString inside = text;
    inside.replace(u'\\', QStringLiteral("\\\\")).replace(u'\'', QStringLiteral("\\'"));
    return u'\'' + inside + u'\'';
}

/// What completes a value of a kind; empty for any file, and where only the user knows.
QString completingInFish(ArgumentKind kind)
{
    switch (kind) {
    case ArgumentKind::Folder: return QStringLiteral("(__fish_complete_directories)");
    case ArgumentKind::TemplateName: return QStringLiteral("(__kareport_template_names)");
    case ArgumentKind::TableName: return QStringLiteral("(__kareport_parts table)");
    case ArgumentKind::BlockName: return QStringLiteral("(__kareport_parts block)");
    default: break;
    }
    QStringList calls;
    for (const QString &ending : endingsOf(kind)) {
        calls.append(QStringLiteral("(__fish_complete_suffix .%1)").arg(ending));
    }
    return calls.isEmpty() ? fixedValuesOf(kind).join(u' ') : calls.join(u' ');
}

/// The part of a `complete` command that says what a value is completed with.
QString valueArguments(ArgumentKind kind, const QStringList &commands)
{
    if (kind == ArgumentKind::Flag) {
        return {};
    }
    if (kind == ArgumentKind::File) {
        return QStringLiteral(" -r -F");
    }
    const QString words = kind == ArgumentKind::Command ? commands.join(u' ') : completingInFish(kind);
    return words.isEmpty() ? QStringLiteral(" -x") : QStringLiteral(" -x -a ") + inFishQuotes(words);
}

QString optionLine(const CommandWords &command, const OptionWords &option, const QStringList &commands)
{
    QString line = QStringLiteral("complete -c kareport -n '__kareport_command_is %1'").arg(command.name);
    if (!option.shortName.isEmpty()) {
        line += QStringLiteral(" -s ") + option.shortName.mid(1);
    }
    line += QStringLiteral(" -l ") + option.longName.mid(2) + valueArguments(option.kind, commands);
    return line + QStringLiteral(" -d ") + inFishQuotes(option.description) + u'\n';
}

} // namespace

QString fishCompletion(const std::vector<CommandWords> &commands)
{
    QString script = QString::fromUtf8(fishFunctions);
    const QStringList names = commandNames(commands);
    for (const CommandWords &command : commands) {
        script += QStringLiteral("complete -c kareport -n __kareport_command_is -a %1 -d %2\n")
                      .arg(command.name, inFishQuotes(command.description));
    }
    for (const CommandWords &command : commands) {
        script += u'\n';
        for (const OptionWords &option : command.options) {
            script += optionLine(command, option, names);
        }
        for (const OptionWords &argument : command.arguments) {
            QString value = valueArguments(argument.kind, names);
            value.replace(QStringLiteral(" -x"), QString()).replace(QStringLiteral(" -r"), QString());
            if (!value.isEmpty()) {
                script += QStringLiteral("complete -c kareport -n '__kareport_command_is %1'").arg(command.name) +
                          value + u'\n';
            }
        }
    }
    return script;
}

} // namespace kareport
