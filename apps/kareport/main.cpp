#include "CommandOptions.h"
#include "Commands.h"
#include "ProcessSetup.h"
#include "Signals.h"

#include <CLI/CLI.hpp>

#include <cstdio>
#include <new>
#include <sstream>
#include <string>

namespace
{

using kareport::exitUsage;

/// Runs a command that makes reports.
template <typename Command>
int runReportCommand(const Command &command, const char *name, int argc, char **argv)
{
    if (const auto wrong = command.usageError()) {
        kareport::printError(QStringLiteral("kareport: ") + *wrong);
        kareport::printError(QStringLiteral("See kareport %1 --help.").arg(QLatin1StringView(name)));
        return exitUsage;
    }
    return command.run(argc, argv);
}

/// Prints the help, or what is wrong with the command line and with which of its words.
int exitParsing(const CLI::App &program, const CLI::ParseError &error)
{
    std::ostringstream out;
    std::ostringstream wrong;
    const int status = program.exit(error, out, wrong);
    const auto print = [](const std::ostringstream &stream, void (*printOne)(const QString &)) {
        const QString all = kareport::optionText(stream.str());
        for (const QString &line : all.isEmpty() ? QStringList() : all.chopped(1).split(u'\n')) {
            printOne(line);
        }
    };
    print(out, kareport::printLine);
    print(wrong, kareport::printError);
    return status == 0 ? 0 : exitUsage;
}

int runProgram(int argc, char **argv)
{
    CLI::App program("Fixed-pitch reports for civil engineering and surveying");
    program.name("kareport");
    program.set_version_flag("--version", "kareport " KAREPORT_VERSION);
    program.require_subcommand(1);
    program.footer("Exit status: 0 done, 1 wrong command line, 2 wrong input (nothing of it is written), "
                   "3 an output could not be written.\n"
                   "See kareport COMMAND --help for the options of a command.");

    kareport::RenderOptions render;
    CLI::App *renderCommand = kareport::addRender(program, render);

    kareport::ConvertOptions convert;
    CLI::App *convertCommand = kareport::addConvert(program, convert);

    std::string templatesFile;
    std::string templatesName;
    bool templatesJson = false;
    CLI::App *templatesCommand = program.add_subcommand("templates", "List the templates of a template file");
    templatesCommand->add_option("FILE", templatesFile, "Template file")->required();
    templatesCommand
        ->add_option("-n,--name", templatesName, "Show this template's tables, blocks, dictionaries and options")
        ->type_name("NAME");
    templatesCommand->add_flag("--json", templatesJson, "Write JSON, for programs");

    kareport::CheckOptions check;
    CLI::App *checkCommand = kareport::addCheck(program, check);

    std::string viewFile;
    CLI::App *viewCommand = program.add_subcommand("view", "Open a report, a job or a template in a window");
    viewCommand->add_option("FILE", viewFile, "Report (.rep, .rtf), job (.json) or template (.xml)")->required();

    try {
        program.parse(argc, argv);
    } catch (const CLI::ParseError &error) {
        return exitParsing(program, error);
    }

    if (renderCommand->parsed()) {
        return runReportCommand(render.command(), "render", argc, argv);
    }
    if (convertCommand->parsed()) {
        return runReportCommand(convert.command(), "convert", argc, argv);
    }
    if (viewCommand->parsed()) {
        return kareport::ViewCommand{kareport::optionText(viewFile)}.run(argc, argv);
    }
    if (templatesCommand->parsed()) {
        return kareport::TemplatesCommand{kareport::optionText(templatesFile), kareport::optionText(templatesName),
                                          templatesJson}
            .run();
    }
    if (checkCommand->parsed()) {
        return runReportCommand(check.command(), "check", argc, argv);
    }
    return exitUsage;
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
        return finish(runProgram(argc, argv));
    } catch (const std::bad_alloc &) {
        // Without memory, no text can be put together either.
        std::fputs("kareport: error: there is not enough memory for this input\n", stderr);
        return kareport::exitInput;
    }
}
