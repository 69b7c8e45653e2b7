#include "CommandLineErrors.h"

#include "NearestName.h"
#include "Xlate.h"

#include <QFileInfo>

#include <utility>

namespace kareport
{

namespace
{

/// The command that a file in place of one was meant for; empty for another word.
QString commandForFile(const QString &word)
{
    constexpr std::pair<const char *, const char *> rows[] = {
        {".json", "render"}, {".xml", "check"}, {".rep", "view"}, {".rtf", "view"}};
    for (const auto &[ending, command] : rows) {
        if (word.endsWith(QLatin1StringView(ending), Qt::CaseInsensitive) && QFileInfo(word).isFile()) {
            return QStringLiteral("kareport %1 %2").arg(QLatin1StringView(command), word);
        }
    }
    return {};
}

/// A sentence about an unknown option. @param owner  the command, or the program
QString unknownOption(const QString &owner, const QString &word, const QStringList &names)
{
    const auto withoutDashes = [](QString name) {
        while (name.startsWith(u'-')) {
            name.remove(0, 1);
        }
        return name;
    };
    // The value that was given with it says nothing about its name.
    const QString name = word.left(word.indexOf(u'='));
    QStringList known;
    for (const QString &one : names) {
        if (one.startsWith(u"--")) {
            known.append(withoutDashes(one));
        }
    }
    const QString sentence = Xlate("%1 has no option \"%2\"").arg(owner, name);
    const QString nearest = nearestName(withoutDashes(name), known);
    return nearest.isEmpty()
               ? sentence
               : sentence + QStringLiteral(": ") + Xlate("did you mean \"%1\"?").arg(QStringLiteral("--") + nearest);
}

/// The words that the parser had no use for.
QStringList restOf(const CLI::App &program)
{
    QStringList rest;
    for (const std::string &word : program.remaining(true)) {
        if (word != "--") {
            rest.append(textOf(word));
        }
    }
    return rest;
}

QString mistakeInRest(const CommandWords *command, const QString &word, const QStringList &names)
{
    const bool isOption = word.startsWith(u'-') && word != u"-";
    if (command == nullptr) {
        return isOption ? unknownOption(QStringLiteral("kareport"), word,
                                        {QStringLiteral("--help"), QStringLiteral("--version")})
                        : unknownCommand(word, names);
    }
    if (isOption && findOption(*command, word.left(word.indexOf(u'='))) != nullptr) {
        return Xlate("\"%1\" was expected after \"%2\"").arg(word, command->name);
    }
    return isOption ? unknownOption(command->name, word, optionNames(*command))
                    : Xlate("%1: \"%2\" was not expected").arg(command->name, word);
}

/// What the parser says, in the words of this program. It names the option first.
QString mistakeOfOption(const CommandWords *command, const CLI::ParseError &error)
{
    const QString said = textOf(error.what());
    const QString owner = command != nullptr ? command->name : QStringLiteral("kareport");
    if (dynamic_cast<const CLI::RequiredError *>(&error) != nullptr) {
        return Xlate("%1: %2 was expected").arg(owner, said.section(u' ', 0, 0));
    }
    const QString name = said.section(u':', 0, 0);
    const OptionWords *option = command != nullptr ? findOption(*command, name) : nullptr;
    if (option != nullptr && dynamic_cast<const CLI::ArgumentMismatch *>(&error) != nullptr) {
        return said.contains(QStringLiteral("missing"))
                   ? Xlate("%1: %2 was expected").arg(option->longName, option->valueName)
                   : Xlate("%1 was given more than once").arg(option->longName);
    }
    const QString wrongValue = QStringLiteral("Could not convert: ");
    if (said.startsWith(wrongValue)) {
        const QString assigned = said.mid(wrongValue.size());
        return Xlate("%1 \"%2\": a whole number was expected")
            .arg(assigned.section(QStringLiteral(" = "), 0, 0), assigned.section(QStringLiteral(" = "), 1));
    }
    return said;
}

} // namespace

QString unknownCommand(const QString &word, const QStringList &names)
{
    const QString other = commandForFile(word);
    const QString question = other.isEmpty() ? oneOfExpected(word, names) : Xlate("did you mean \"%1\"?").arg(other);
    return Xlate("\"%1\" is not a command: %2").arg(word, question);
}

QString parsingMistake(const CommandLine &line, const CLI::ParseError &error)
{
    const auto words = line.words();
    const auto parsed = line.program.get_subcommands();
    const CommandWords *command = parsed.empty() ? nullptr : findCommand(words, textOf(parsed.front()->get_name()));
    const QStringList rest = restOf(line.program);
    if (!rest.isEmpty()) {
        return mistakeInRest(command, rest.first(), commandNames(words));
    }
    if (command == nullptr) {
        return Xlate("a command was expected: %1").arg(commandNames(words).join(QStringLiteral(", ")));
    }
    return mistakeOfOption(command, error);
}

} // namespace kareport
