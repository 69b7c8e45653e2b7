#include "Commands.h"
#include "OutputKind.h"
#include "ProcessSetup.h"
#include "Signals.h"

#include <CLI/CLI.hpp>

#include <cstdio>
#include <new>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

namespace
{

using kareport::exitUsage;

QStringList texts(const std::vector<std::string> &values)
{
    QStringList list;
    for (const std::string &value : values) {
        list.append(QString::fromLocal8Bit(value.data(), static_cast<qsizetype>(value.size())));
    }
    return list;
}

QString text(const std::string &value)
{
    return QString::fromLocal8Bit(value.data(), static_cast<qsizetype>(value.size()));
}

std::optional<QString> textIfAny(const std::optional<std::string> &value)
{
    return value ? std::optional(text(*value)) : std::nullopt;
}

std::string kindNames()
{
    return kareport::outputKindNames().toStdString();
}

/// What the options about the data of the short form are read into.
struct DataWords
{
    std::optional<std::string> delimiter;
    std::vector<std::string> columns;
    std::optional<std::string> order;
    std::vector<std::string> units;
    std::optional<std::string> decimal;
    std::optional<std::string> thousands;
    std::optional<std::string> encoding;
    std::optional<std::string> comment;
    std::optional<int> skip;
    bool hasNoHeader = false;
    bool skipsBlankLines = false;

    kareport::DataOptions options() const
    {
        return {textIfAny(delimiter), texts(columns),      textIfAny(order),   texts(units), textIfAny(decimal),
                textIfAny(thousands), textIfAny(encoding), textIfAny(comment), skip,         hasNoHeader,
                skipsBlankLines};
    }
};

void addDataOptions(CLI::App &render, DataWords &words)
{
    const char *group = "Data of --data";
    render
        .add_option("--delimiter", words.delimiter,
                    "Delimiter of the cells: a character, tab, whitespace, or auto to detect it; a comma "
                    "otherwise")
        ->type_name("CHAR")
        ->group(group);
    render
        .add_option("--columns", words.columns,
                    "Names of the columns in their order, such as Number,Northing,-, or columns of variables by "
                    "name or number, such as Elevation=Height,Number=1")
        ->type_name("LIST")
        ->allow_extra_args(false)
        ->group(group);
    render.add_option("--order", words.order, "The columns in short form, such as PNEZD; - skips one")
        ->type_name("LETTERS")
        ->group(group);
    render.add_option("--units", words.units, "Units of the numbers, such as length=usft,angle=dms")
        ->type_name("LIST")
        ->allow_extra_args(false)
        ->group(group);
    render.add_option("--decimal", words.decimal, "Decimal sign of the numbers, . or ,")
        ->type_name("CHAR")
        ->group(group);
    render.add_option("--thousands", words.thousands, "Separator of groups of three digits")
        ->type_name("CHAR")
        ->group(group);
    render.add_option("--encoding", words.encoding, "utf-8, latin-1, windows-1252 or utf-16")
        ->type_name("NAME")
        ->group(group);
    render.add_option("--comment", words.comment, "Skip lines that begin with this character")
        ->type_name("CHAR")
        ->group(group);
    render.add_option("--skip", words.skip, "Skip this many lines at the beginning")->type_name("N")->group(group);
    render.add_flag("--no-header", words.hasNoHeader, "The first row is data already")->group(group);
    render.add_flag("--skip-blank-lines", words.skipsBlankLines, "Skip blank lines")->group(group);
}

/// What the options of `kareport render` are read into.
struct RenderOptions
{
    std::vector<std::string> jobs;
    std::string jobList;
    std::optional<std::string> slice;
    bool onlyOutdated = false;
    std::string templateFile;
    std::string templateName;
    std::string table;
    std::string block;
    std::string data;
    std::vector<std::string> outputs;
    std::string as;
    std::vector<std::string> sets;
    std::optional<std::string> limit;
    bool strict = false;
    std::optional<std::string> notes;
    DataWords dataWords;
    bool progress = false;
    bool quiet = false;

    kareport::RenderCommand command() const
    {
        return {texts(jobs),
                text(jobList),
                textIfAny(slice),
                onlyOutdated,
                {text(templateFile), text(templateName), text(table), text(block), text(data)},
                dataWords.options(),
                texts(outputs),
                text(as),
                texts(sets),
                textIfAny(limit),
                strict,
                textIfAny(notes),
                progress,
                quiet};
    }
};

CLI::App *addRender(CLI::App &program, RenderOptions &options)
{
    CLI::App *render =
        program.add_subcommand("render", "Make reports from job files, or one from a template and a data file");
    render->add_option("JOB", options.jobs,
                       "Job file (JSON), - for standard input; several are run one after the other");
    render->add_option("--jobs", options.jobList, "File with the name of a job file on each line; - for standard input")
        ->type_name("FILE");
    render
        ->add_option("--slice", options.slice,
                     "Run only every Nth job, beginning with the Kth, so that several processes share a list")
        ->type_name("K/N");
    render->add_flag("--update", options.onlyOutdated,
                     "Skip a job whose outputs are newer than its job file, template and data");
    render->add_option("-t,--template", options.templateFile, "Template file, instead of a job file")
        ->type_name("FILE");
    render->add_option("-n,--name", options.templateName, "Name of the template in the file")->type_name("NAME");
    render->add_option("--table", options.table, "Table of the template that the data is written through")
        ->type_name("NAME");
    render->add_option("--block", options.block, "Block of the template that the first row is written through")
        ->type_name("NAME");
    render
        ->add_option(
            "-d,--data", options.data,
            "Data file (CSV with a header row of variable names, or as the options below say); - for standard input")
        ->type_name("FILE");
    render
        ->add_option("-o,--output", options.outputs,
                     "Output file instead of the job's; - for standard output, {} for the job file's name. Can be "
                     "given several times")
        ->type_name("FILE")
        ->allow_extra_args(false);
    render->add_option("--as", options.as, "Kind of the outputs whose names do not show it: " + kindNames())
        ->type_name("KIND");
    render
        ->add_option("--set", options.sets,
                     "Set a key of the job, such as settings.lengthUnit=ft. Can be given several times")
        ->type_name("KEY=VALUE")
        ->allow_extra_args(false);
    render
        ->add_option("--limit", options.limit,
                     "Write no report whose text or output is larger than this, such as 20M (K, M, G, or bytes)")
        ->type_name("SIZE");
    render->add_flag("--strict", options.strict,
                     "Treat it as an error when a column is not a variable, or when no column fills a field");
    render->add_option("--notes", options.notes, "Write the notes on the data to a file, as JSON")->type_name("FILE");
    render->add_flag("--progress", options.progress, "Show the progress of the work");
    render->add_flag("--quiet", options.quiet, "Print nothing but errors");
    addDataOptions(*render, options.dataWords);
    render->footer(
        "Examples:\n"
        "  kareport render stakeout.json\n"
        "  kareport render stakeout.json -o - | less\n"
        "  kareport render stakeout.json --set settings.lengthUnit=usft -o stakeout-ft.rep\n"
        "  kareport render --template survey.xml --name CONTROL --table Points --data points.csv -o points.txt\n"
        "  total-station | kareport render -t survey.xml -n CONTROL --table Points --data - --no-header --order PNEZD\n"
        "  kareport render jobs/*.json -o 'sheets/{}.pdf'\n"
        "  find jobs -name '*.json' | sort | kareport render --jobs - --slice 1/8 --update");
    return render;
}

/// What the options of `kareport convert` are read into.
struct ConvertOptions
{
    std::string input;
    std::string output;
    std::string as;
    std::vector<std::string> sets;
    bool progress = false;
    bool quiet = false;

    kareport::ConvertCommand command() const
    {
        return {text(input), text(output), text(as), texts(sets), progress, quiet};
    }
};

CLI::App *addConvert(CLI::App &program, ConvertOptions &options)
{
    CLI::App *convert =
        program.add_subcommand("convert", "Convert a saved report to another kind, by the endings of the names");
    convert->add_option("IN", options.input, "Saved report: a report file, rich text, or plain text in UTF-8")
        ->required();
    convert->add_option("OUT", options.output, "Output file; - for standard output")->required();
    convert->add_option("--as", options.as, "Kind of the output if its name does not show it: " + kindNames())
        ->type_name("KIND");
    convert
        ->add_option("--set", options.sets,
                     "Set a key of the page, such as page.linesPerPage=60. Can be given several times")
        ->type_name("KEY=VALUE")
        ->allow_extra_args(false);
    convert->add_flag("--progress", options.progress, "Show the progress of the work");
    convert->add_flag("--quiet", options.quiet, "Print nothing but errors");
    convert->footer(
        "The pages of a PDF are those of the report: its header lines give the number of lines of a page. A\n"
        "report without header lines is cut into pages as measured, or as page.linesPerPage says.\n"
        "Examples:\n"
        "  kareport convert stakeout.rep stakeout.pdf\n"
        "  kareport convert stakeout.rep stakeout.pdf --set page.paper=Letter --set page.linesPerPage=60");
    return convert;
}

/// What the options of `kareport check` are read into.
struct CheckOptions
{
    std::vector<std::string> files;
    std::vector<std::string> sets;
    bool strict = false;
    std::optional<std::string> notes;
    bool json = false;
    bool progress = false;
    bool quiet = false;

    kareport::CheckCommand command() const
    {
        return {texts(files), texts(sets), strict, textIfAny(notes), json, progress, quiet};
    }
};

CLI::App *addCheck(CLI::App &program, CheckOptions &options)
{
    CLI::App *check = program.add_subcommand(
        "check", "Report what in template files is not read as it looks, and how the data of jobs fits its template");
    check->add_option("FILE", options.files, "Template file (XML) or job file (JSON), - for a job on standard input")
        ->required();
    check
        ->add_option("--set", options.sets,
                     "Set a key of the jobs, such as settings.lengthUnit=ft. Can be given several times")
        ->type_name("KEY=VALUE")
        ->allow_extra_args(false);
    check->add_flag("--strict", options.strict, "Treat it as an error when data and template do not match");
    check->add_option("--notes", options.notes, "Write the notes on the data of a job to a file, as JSON")
        ->type_name("FILE");
    check->add_flag("--json", options.json, "Write JSON, for programs");
    check->add_flag("--progress", options.progress, "Show the progress of the work");
    check->add_flag("--quiet", options.quiet, "Print nothing but errors");
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
        const QString all = text(stream.str());
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

    RenderOptions render;
    CLI::App *renderCommand = addRender(program, render);

    ConvertOptions convert;
    CLI::App *convertCommand = addConvert(program, convert);

    std::string templatesFile;
    std::string templatesName;
    bool templatesJson = false;
    CLI::App *templatesCommand = program.add_subcommand("templates", "List the templates of a template file");
    templatesCommand->add_option("FILE", templatesFile, "Template file")->required();
    templatesCommand
        ->add_option("-n,--name", templatesName, "Show this template's tables, blocks, dictionaries and options")
        ->type_name("NAME");
    templatesCommand->add_flag("--json", templatesJson, "Write JSON, for programs");

    CheckOptions check;
    CLI::App *checkCommand = addCheck(program, check);

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
        return kareport::ViewCommand{text(viewFile)}.run(argc, argv);
    }
    if (templatesCommand->parsed()) {
        return kareport::TemplatesCommand{text(templatesFile), text(templatesName), templatesJson}.run();
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
