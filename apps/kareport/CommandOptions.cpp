#include "CommandOptions.h"

#include "OutputKind.h"
#include "SystemPath.h"

namespace kareport
{

namespace
{

CLI::App *addConvert(CLI::App &program, ConvertWords &words, ArgumentKinds &kinds)
{
    CLI::App *convert =
        program.add_subcommand("convert", "Convert a saved report to another kind, by the endings of the names");
    kinds
        .note(ArgumentKind::SavedReport,
              convert->add_option("IN", words.input, "Saved report: a report file, rich text, or plain text in UTF-8"))
        ->required();
    kinds.note(ArgumentKind::File, convert->add_option("OUT", words.output, "Output file; - for standard output"))
        ->required();
    addAs(*convert, words.as, "Kind of the output if its name does not show it", kinds);
    addSets(*convert, words.sets, ArgumentKind::PageKey,
            "Set a key of the page, such as page.linesPerPage=60. Can be given several times", kinds);
    addParents(*convert, words.parents);
    convert->add_flag("--progress", words.progress, "Show the progress of the work");
    convert->add_flag("--quiet", words.quiet, "Print nothing but errors");
    convert->footer(
        "The pages of a PDF are those of the report: its header lines give the number of lines of a page. A\n"
        "report without header lines is cut into pages as measured, or as page.linesPerPage says.\n"
        "Examples:\n"
        "  kareport convert stakeout.rep stakeout.pdf\n"
        "  kareport convert stakeout.rep stakeout.pdf --set page.paper=Letter --set page.linesPerPage=60");
    return convert;
}

CLI::App *addTemplates(CLI::App &program, TemplatesWords &words, ArgumentKinds &kinds)
{
    CLI::App *templates = program.add_subcommand("templates", "List the templates of a template file");
    kinds.note(ArgumentKind::TemplateFile, templates->add_option("FILE", words.file, "Template file"))->required();
    kinds
        .note(ArgumentKind::TemplateName,
              templates->add_option("-n,--name", words.name,
                                    "Show this template's tables, blocks, dictionaries and options"))
        ->type_name("NAME");
    templates->add_flag("--json", words.json, "Write JSON, for programs");
    return templates;
}

CLI::App *addCheck(CLI::App &program, CheckWords &words, ArgumentKinds &kinds)
{
    CLI::App *check = program.add_subcommand(
        "check", "Find mistakes in template files, and say how the data of jobs fits its template");
    kinds
        .note(ArgumentKind::CheckedFile,
              check->add_option("FILE", words.files,
                                "Template file (XML) or job file (JSON), - for a job on standard input"))
        ->required();
    addSets(*check, words.sets, ArgumentKind::SetKey,
            "Set a key of the jobs, such as settings.lengthUnit=ft. Can be given several times", kinds);
    check->add_flag("--strict", words.strict, "Treat it as an error when data and template do not match");
    kinds
        .note(ArgumentKind::File,
              check->add_option("--notes", words.notes, "Write the notes on the data of a job to a file, as JSON"))
        ->type_name("FILE");
    addParents(*check, words.parents);
    check->add_flag("--json", words.json, "Write JSON, for programs");
    check->add_flag("--progress", words.progress, "Show the progress of the work");
    check->add_flag("--quiet", words.quiet, "Print nothing but errors");
    check->footer(
        "Each remark is one line, file:line:column: warning|error: text. Of a job, the template, the data and all steps\n"
        "are checked, and each field that data is printed in is listed: the width of its column, the widest value with its\n"
        "row, and whether values and label fit. Nothing is written.\n"
        "Exit status: 0 without errors, 2 with.\n"
        "Examples:\n"
        "  kareport check survey.xml stakeout.json\n"
        "  kareport check stakeout.json --set settings.lengthUnit=usft");
    return check;
}

CLI::App *addNew(CLI::App &program, NewWords &words, ArgumentKinds &kinds)
{
    CLI::App *add = program.add_subcommand("new", "Write a template, data and a job to start with");
    kinds.note(
        ArgumentKind::Folder,
        add->add_option("DIR", words.folder,
                        "Folder that they are written into and named after, made if it is not there; the current "
                        "folder otherwise"));
    add->add_flag("--parents", words.parents, "Make the folders that DIR is in as well");
    add->add_flag("--quiet", words.quiet, "Print nothing but errors");
    add->footer("Nothing that is there is replaced.\n"
                "Examples:\n"
                "  kareport new harbour\n"
                "  kareport render harbour/harbour.json");
    return add;
}

CommandWords wordsOf(const CLI::App &command, const ArgumentKinds &kinds)
{
    CommandWords words{textOf(command.get_name()), textOf(command.get_description()), {}, {}};
    for (const CLI::Option *option : command.get_options()) {
        OptionWords one;
        one.kind = kinds.of(option);
        one.description = textOf(option->get_description());
        one.isRepeated = option->get_expected_max() > 1;
        if (option->get_positional()) {
            one.valueName = textOf(option->get_name(true));
            words.arguments.push_back(one);
            continue;
        }
        one.longName = QStringLiteral("--") + textOf(option->get_lnames().front());
        one.shortName = option->get_snames().empty() ? QString() : u'-' + textOf(option->get_snames().front());
        one.valueName = one.kind == ArgumentKind::Flag ? QString() : textOf(option->get_type_name());
        words.options.push_back(one);
    }
    return words;
}

} // namespace

QString textOf(const std::string &word)
{
    return kareport::textOfSystem(QByteArray(word.data(), static_cast<qsizetype>(word.size())));
}

QStringList textsOf(const std::vector<std::string> &words)
{
    QStringList list;
    for (const std::string &word : words) {
        list.append(textOf(word));
    }
    return list;
}

CLI::Option *ArgumentKinds::note(ArgumentKind kind, CLI::Option *option)
{
    kinds_.insert_or_assign(option, kind);
    return option;
}

ArgumentKind ArgumentKinds::of(const CLI::Option *option) const
{
    const auto found = kinds_.find(option);
    return found != kinds_.end() ? found->second : ArgumentKind::Flag;
}

void addAs(CLI::App &command, std::string &as, const char *text, ArgumentKinds &kinds)
{
    const std::string sentence = std::string(text) + ": " + outputKindNames().toStdString();
    kinds.note(ArgumentKind::OutputKind, command.add_option("--as", as, sentence))->type_name("KIND");
}

void addSets(CLI::App &command, std::vector<std::string> &sets, ArgumentKind kind, const char *text,
             ArgumentKinds &kinds)
{
    kinds.note(kind, command.add_option("--set", sets, text))->type_name("KEY=VALUE")->allow_extra_args(false);
}

void addParents(CLI::App &command, bool &parents)
{
    command.add_flag("--parents", parents, "Make the folders of outputs that are not there");
}

ConvertCommand ConvertWords::command() const
{
    return {textOf(input), textOf(output), textOf(as), textsOf(sets), parents, progress, quiet};
}

CheckCommand CheckWords::command() const
{
    return {textsOf(files), textsOf(sets), strict,   notes ? std::optional(textOf(*notes)) : std::nullopt,
            json,           parents,       progress, quiet};
}

TemplatesCommand TemplatesWords::command() const
{
    return {textOf(file), textOf(name), json};
}

NewCommand NewWords::command() const
{
    return {textOf(folder), parents, quiet};
}

CommandLine::CommandLine()
{
    program.name("kareport");
    program.allow_windows_style_options(false); // a word that begins with a slash is a file
    program.set_version_flag("--version", "kareport " KAREPORT_VERSION);
    program.require_subcommand(1);
    program.footer("Exit status: 0 done, 1 wrong command line, 2 wrong input (nothing of it is written), "
                   "3 an output could not be written.\n"
                   "See kareport COMMAND --help for the options of a command.");
    renderCommand = addRender(program, render, kinds);
    watchCommand = addWatch(program, watch, kinds);
    convertCommand = addConvert(program, convert, kinds);
    templatesCommand = addTemplates(program, templates, kinds);
    checkCommand = addCheck(program, check, kinds);
    newCommand = addNew(program, newJob, kinds);
    viewCommand = program.add_subcommand("view", "Open a report, a job or a template in a window");
    kinds
        .note(ArgumentKind::ViewedFile,
              viewCommand->add_option("FILE", viewFile, "Report (.rep, .rtf), job (.json) or template (.xml)"))
        ->required();
    helpCommand = program.add_subcommand("help", "Show the help of a command");
    kinds.note(ArgumentKind::Command, helpCommand->add_option("COMMAND", helpFor, "Command; all of them otherwise"));
    completionCommand = program.add_subcommand("completion", "Print what completes the command line in a shell");
    kinds.note(ArgumentKind::Shell, completionCommand->add_option("SHELL", shell, "bash, zsh or fish"))->required();
    completionCommand->footer("The package has installed it already.\n"
                              "Example:\n"
                              "  source <(kareport completion bash)");
}

std::vector<CommandWords> CommandLine::words() const
{
    std::vector<CommandWords> words;
    for (const CLI::App *command : program.get_subcommands([](const CLI::App *) { return true; })) {
        words.push_back(wordsOf(*command, kinds));
    }
    return words;
}

} // namespace kareport
