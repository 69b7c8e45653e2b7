#include "Completion.h"

namespace kareport
{

namespace
{

// It needs nothing but bash: the package bash-completion loads it by its name, but it can be sourced without that as well.
constexpr const char *bashFunctions = R"sh(# Completion of kareport for bash. Made by "kareport completion bash".

# Prints a word of the command line without its quotes.
_kareport_plain()
{
    printf '%s\n' "${1//[\"\'\\]/}"
}

# Prints the value that one of some options has on the command line.
_kareport_value()
{
    local i option
    for ((i = 2; i + 1 < ${#COMP_WORDS[@]}; i++)); do
        for option; do
            if [[ ${COMP_WORDS[i]} == "$option" ]]; then
                [[ ${COMP_WORDS[i + 1]} == = ]] && ((i++))
                _kareport_plain "${COMP_WORDS[i + 1]}"
                return
            fi
        done
    done
}

# Prints the template file of the command line: the option's, or the argument of "kareport templates".
_kareport_template()
{
    local i
    if [[ $command == templates ]]; then
        for ((i = 2; i < ${#COMP_WORDS[@]}; i++)); do
            if ((i != COMP_CWORD)) && [[ ${COMP_WORDS[i]} != -* && ${COMP_WORDS[i - 1]} != -n && ${COMP_WORDS[i - 1]} != --name ]]; then
                _kareport_plain "${COMP_WORDS[i]}"
                return
            fi
        done
    else
        _kareport_value -t --template
    fi
}

# Takes the lines of standard input that begin with the word at the cursor.
_kareport_lines()
{
    local line plain
    plain=$(_kareport_plain "$cur")
    compopt -o filenames 2> /dev/null # blanks are quoted
    while IFS= read -r line; do
        [[ $line == "$plain"* ]] && COMPREPLY+=("$line")
    done
}

_kareport_words()
{
    COMPREPLY=($(compgen -W "$1" -- "$cur"))
}

# Takes files with one of some endings and folders; any file where no ending is given, or no file has one.
_kareport_files()
{
    local ending plain
    plain=$(_kareport_plain "$cur")
    _kareport_lines < <(
        for ending; do
            compgen -f -X "!*.$ending" -- "$plain"
            compgen -f -X "!*.${ending^^}" -- "$plain"
        done
        (($# == 0)) || compgen -d -- "$plain"
    )
    ((${#COMPREPLY[@]} > 0)) || _kareport_lines < <(compgen -f -- "$plain")
}

_kareport_folders()
{
    _kareport_lines < <(compgen -d -- "$(_kareport_plain "$cur")")
}

# Takes the keys of KEY=VALUE, or the values where the key is there already.
_kareport_keys()
{
    local candidate
    for candidate in $1; do
        if [[ -n $key && $candidate == "$key=$cur"* && $candidate != "$key=" ]]; then
            COMPREPLY+=("${candidate#"$key="}")
        elif [[ -z $key && $candidate == "$cur"* && " ${COMPREPLY[*]} " != *" ${candidate%%=*}= "* ]]; then
            COMPREPLY+=("${candidate%%=*}=")
            compopt -o nospace 2> /dev/null
        fi
    done
}

_kareport_names()
{
    local template name
    template=$(_kareport_template)
    [[ -n $template ]] || return
    template=${template/#\~\//$HOME/}
    if [[ $1 == template ]]; then
        _kareport_lines < <("$program" templates "$template" 2> /dev/null | cut -f 1)
    else
        name=$(_kareport_value -n --name)
        _kareport_lines < <("$program" templates "$template" --name "$name" 2> /dev/null |
            sed -n "s/^$1 \\(.*\\) (dictionary .*)\$/\\1/p")
    fi
}

_kareport()
{
    local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD - 1]} program command='' key='' equals=0 i
    program=$(_kareport_plain "${COMP_WORDS[0]}")
    program=${program/#\~\//$HOME/}
    COMPREPLY=()
    for ((i = 1; i < COMP_CWORD; i++)); do
        if [[ ${COMP_WORDS[i]} != -* ]]; then
            command=${COMP_WORDS[i]}
            break
        fi
    done

    # Readline takes the "=" of --output=FILE and of KEY=VALUE for a word.
    if [[ $cur == = ]]; then
        equals=$COMP_CWORD
        cur=
    elif [[ $prev == = ]]; then
        equals=$((COMP_CWORD - 1))
    fi
    if ((equals > 1)); then
        prev=${COMP_WORDS[equals - 1]}
        if [[ $prev != -* ]]; then
            key=$prev
            prev=${COMP_WORDS[equals - 2]}
            [[ $prev == = ]] && prev=${COMP_WORDS[equals - 3]}
        fi
    fi

)sh";

/// The call that completes a value of a kind.
QString completingInBash(ArgumentKind kind)
{
    const QStringList values = fixedValuesOf(kind);
    switch (kind) {
    case ArgumentKind::Flag:
    case ArgumentKind::Text: return QStringLiteral("return");
    case ArgumentKind::Folder: return QStringLiteral("_kareport_folders");
    case ArgumentKind::TemplateName: return QStringLiteral("_kareport_names template");
    case ArgumentKind::TableName: return QStringLiteral("_kareport_names table");
    case ArgumentKind::BlockName: return QStringLiteral("_kareport_names block");
    case ArgumentKind::SetKey:
    case ArgumentKind::PageKey: return QStringLiteral("_kareport_keys '%1'").arg(values.join(u' '));
    case ArgumentKind::Command: return QStringLiteral("_kareport_words \"$commands\"");
    default: break;
    }
    if (!values.isEmpty()) {
        return QStringLiteral("_kareport_words '%1'").arg(values.join(u' '));
    }
    return QStringLiteral("_kareport_files %1").arg(endingsOf(kind).join(u' ')).trimmed();
}

/// What an argument of a command is completed with. Which of several it is does not show here: any file is taken.
QString completingArgument(const CommandWords &command)
{
    if (command.arguments.empty()) {
        return QStringLiteral("return");
    }
    return completingInBash(command.arguments.size() == 1 ? command.arguments.front().kind : ArgumentKind::File);
}

QString casesOfValues(const CommandWords &command)
{
    QString cases;
    for (const OptionWords &option : command.options) {
        if (option.kind != ArgumentKind::Flag) {
            QString pattern = command.name + u',' + option.longName;
            if (!option.shortName.isEmpty()) {
                pattern += QStringLiteral(" | ") + command.name + u',' + option.shortName;
            }
            cases += QStringLiteral("        %1)\n            %2\n            return\n            ;;\n")
                         .arg(pattern, completingInBash(option.kind));
        }
    }
    return cases;
}

} // namespace

QString bashCompletion(const std::vector<CommandWords> &commands)
{
    QString script = QString::fromUtf8(bashFunctions);
    QString values;
    QString options;
    QString arguments;
    const QString caseOf = QStringLiteral("        %1) %2 ;;\n");
    for (const CommandWords &command : commands) {
        values += casesOfValues(command);
        options +=
            caseOf.arg(command.name, QStringLiteral("_kareport_words '%1'").arg(optionNames(command).join(u' ')));
        arguments += caseOf.arg(command.name, completingArgument(command));
    }
    script += QStringLiteral("    local commands='%1'\n").arg(commandNames(commands).join(u' '));
    script += QStringLiteral("    case $command,$prev in\n") + values + QStringLiteral("    esac\n");
    script +=
        QStringLiteral("    if [[ $cur == -* ]]; then\n        case $command in\n") +
        options.replace(QStringLiteral("        "), QStringLiteral("            ")) +
        QStringLiteral("            '') _kareport_words '--help --version' ;;\n        esac\n        return\n    fi\n");
    script += QStringLiteral("    case $command in\n        '') _kareport_words \"$commands\" ;;\n") + arguments +
              QStringLiteral("    esac\n}\n\ncomplete -F _kareport kareport\n");
    return script;
}

} // namespace kareport
