#include "CommandLineErrors.h"
#include "CommandOptions.h"
#include "Commands.h"
#include "Completion.h"
#include "NearestName.h"
#include "ProcessSetup.h"
#include "ProgramArguments.h"
#include "Signals.h"
#include "Xlate.h"

#include <cstdio>
#include <new>
#include <sstream>

namespace
{

using kareport::CommandLine;
using kareport::exitUsage;
using kareport::textOf;

void printText(const QString &text)
{
    for (const QString &line : text.isEmpty() ? QStringList() : text.chopped(1).split(u'\n')) {
        kareport::printLine(line);
    }
}

/// Says what is wrong with the command line. @param command  of which it is; empty for the program
int wrongUsage(const QString &sentence, const QString &command)
{
    kareport::printError(QStringLiteral("kareport: ") + sentence);
    const QString blank = command.isEmpty() ? QString() : QStringLiteral(" ");
    kareport::printError(QStringLiteral("See kareport%1 --help.").arg(blank + command));
    return exitUsage;
}

/// Runs a command that makes reports.
template <typename Command>
int runReportCommand(const Command &command, const char *name, int argc, char **argv)
{
    if (const auto wrong = command.usageError()) {
        return wrongUsage(*wrong, QString::fromLatin1(name));
    }
    return command.run(argc, argv);
}

/// Prints the help or the version, or what is wrong with the command line and with which of its words.
int exitParsing(const CommandLine &line, const CLI::ParseError &error)
{
    if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success)) {
        std::ostringstream out;
        line.program.exit(error, out, out);
        printText(textOf(out.str()));
        return kareport::exitDone;
    }
    const auto parsed = line.program.get_subcommands();
    return wrongUsage(parsingMistake(line, error), parsed.empty() ? QString() : textOf(parsed.front()->get_name()));
}

/// As `kareport COMMAND --help`.
int showHelp(const CommandLine &line)
{
    const QStringList names = commandNames(line.words());
    const QString name = textOf(line.helpFor);
    if (name.isEmpty()) {
        printText(
            textOf(line.program.get_formatter()->make_help(&line.program, "kareport", CLI::AppFormatMode::Normal)));
        return kareport::exitDone;
    }
    if (!names.contains(name)) {
        return wrongUsage(kareport::unknownCommand(name, names), QString());
    }
    printText(textOf(line.program.get_subcommand(line.helpFor)->help("kareport")));
    return kareport::exitDone;
}

int printCompletion(const CommandLine &line)
{
    const auto shell = kareport::shellFromName(textOf(line.shell));
    if (!shell) {
        const QString expected =
            kareport::oneOfExpected(textOf(line.shell), fixedValuesOf(kareport::ArgumentKind::Shell));
        return wrongUsage(QStringLiteral("\"%1\": %2").arg(textOf(line.shell), expected), QStringLiteral("completion"));
    }
    // A script, not a text for a terminal: its characters stay as they are.
    const QByteArray script = completionScript(*shell, line.words()).toUtf8();
    std::fwrite(script.constData(), 1, static_cast<std::size_t>(script.size()), stdout);
    return kareport::exitDone;
}

int runProgram(int argc, char **argv)
{
    CommandLine line;
    try {
        line.program.parse(argc, argv);
    } catch (const CLI::ParseError &error) {
        return exitParsing(line, error);
    }
    if (line.renderCommand->parsed()) {
        return runReportCommand(line.render.command(), "render", argc, argv);
    }
    if (line.watchCommand->parsed()) {
        return runReportCommand(kareport::WatchCommand{line.watch.command()}, "watch", argc, argv);
    }
    if (line.convertCommand->parsed()) {
        return runReportCommand(line.convert.command(), "convert", argc, argv);
    }
    if (line.viewCommand->parsed()) {
        return kareport::ViewCommand{textOf(line.viewFile)}.run(argc, argv);
    }
    if (line.templatesCommand->parsed()) {
        return line.templates.command().run();
    }
    if (line.checkCommand->parsed()) {
        return runReportCommand(line.check.command(), "check", argc, argv);
    }
    if (line.newCommand->parsed()) {
        return line.newJob.command().run();
    }
    if (line.completionCommand->parsed()) {
        return printCompletion(line);
    }
    return showHelp(line);
}

/// Ends the program's output. @return the exit status
int finish(int status)
{
    if (status == kareport::exitInterrupted) {
        kareport::endByInterrupt();
    }
    // A full disk under standard output shows when the last of it is written.
    if (std::fflush(stdout) != 0 || std::ferror(stdout) != 0) {
        if (!kareport::isOutputReaderGone()) {
            kareport::printError(QStringLiteral("kareport: standard output could not be written"));
        }
        return status == kareport::exitDone ? kareport::exitOutput : status;
    }
    return status;
}

} // namespace

// NOLINTNEXTLINE(bugprone-exception-escape): what else is thrown is an error of the program, which ends it
int main(int argc, char **argv)
{
    try {
        kareport::prepareProcess();
        auto [count, words] = kareport::ProgramArguments::of(argc, argv);
        return finish(runProgram(count, words));
    } catch (const std::bad_alloc &) {
        // Without memory, no text can be composed either.
        std::fputs("kareport: error: there is not enough memory for this input\n", stderr);
        return kareport::exitInput;
    }
}
