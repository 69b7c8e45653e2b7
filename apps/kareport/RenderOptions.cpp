#include "CommandOptions.h"

#include "TextEncoding.h"

namespace kareport
{

namespace
{

std::optional<QString> textIfAny(const std::optional<std::string> &word)
{
    return word ? std::optional(textOf(*word)) : std::nullopt;
}

void addDataOptions(CLI::App &render, DataWords &words, ArgumentKinds &kinds)
{
    const char *group = "Data of --data";
    const auto add = [&](ArgumentKind kind, const char *name, auto &value, const char *type, const std::string &text) {
        return kinds.note(kind, render.add_option(name, value, text))->type_name(type)->group(group);
    };
    add(ArgumentKind::Delimiter, "--delimiter", words.delimiter, "CHAR",
        "Delimiter of the cells: a character, tab, whitespace, or auto to detect it; a comma otherwise");
    add(ArgumentKind::Text, "--columns", words.columns, "LIST",
        "Names of the columns in their order, such as Number,Northing,-, or columns of variables by name or number, such as "
        "Elevation=Height,Number=1")
        ->allow_extra_args(false);
    add(ArgumentKind::Text, "--order", words.order, "LETTERS", "The columns in short form, such as PNEZD; - skips one");
    add(ArgumentKind::Text, "--units", words.units, "LIST", "Units of the numbers, such as length=usft,angle=dms")
        ->allow_extra_args(false);
    add(ArgumentKind::Decimal, "--decimal", words.decimal, "CHAR", "Decimal sign of the numbers, . or ,");
    add(ArgumentKind::Text, "--thousands", words.thousands, "CHAR", "Separator of groups of three digits");
    add(ArgumentKind::Encoding, "--encoding", words.encoding, "NAME",
        ("One of " + textEncodingKeys().join(QStringLiteral(", "))).toStdString());
    add(ArgumentKind::Text, "--comment", words.comment, "CHAR", "Skip lines that begin with this character");
    add(ArgumentKind::Text, "--skip", words.skip, "N", "Skip this many lines at the beginning");
    render.add_flag("--no-header", words.hasNoHeader, "The first row is data already")->group(group);
    render.add_flag("--skip-blank-lines", words.skipsBlankLines, "Skip blank lines")->group(group);
}

/// The options that say what becomes of a report, from --output on.
void addOutputOptions(CLI::App &command, RenderWords &words, ArgumentKinds &kinds)
{
    kinds
        .note(ArgumentKind::File, command.add_option("-o,--output", words.outputs,
                                                     "Output file instead of the job's; - for standard output, {} for "
                                                     "the job file's name. Can be given several times"))
        ->type_name("FILE")
        ->allow_extra_args(false);
    addAs(command, words.as, "Kind of the outputs whose names do not show it", kinds);
    addSets(command, words.sets, ArgumentKind::SetKey,
            "Set a key of the job, such as settings.lengthUnit=ft. Can be given several times", kinds);
    kinds
        .note(ArgumentKind::Text,
              command.add_option("--limit", words.limit,
                                 "Write no report whose text or output is larger than this, such as "
                                 "20M (K, M, G, or bytes)"))
        ->type_name("SIZE");
    command.add_flag("--strict", words.strict,
                     "Treat it as an error when a column is not a variable, or when no column fills a field");
    kinds
        .note(ArgumentKind::File,
              command.add_option("--notes", words.notes, "Write the notes on the data to a file, as JSON"))
        ->type_name("FILE");
    addParents(command, words.parents);
}

void addShortForm(CLI::App &render, RenderWords &words, ArgumentKinds &kinds)
{
    kinds
        .note(ArgumentKind::TemplateFile,
              render.add_option("-t,--template", words.templateFile, "Template file, instead of a job file"))
        ->type_name("FILE");
    kinds
        .note(ArgumentKind::TemplateName,
              render.add_option("-n,--name", words.templateName, "Name of the template in the file"))
        ->type_name("NAME");
    kinds
        .note(ArgumentKind::TableName,
              render.add_option("--table", words.table, "Table of the template that the data is written through"))
        ->type_name("NAME");
    kinds
        .note(ArgumentKind::BlockName,
              render.add_option("--block", words.block, "Block of the template that the first row is written through"))
        ->type_name("NAME");
    kinds
        .note(ArgumentKind::File,
              render.add_option("-d,--data", words.data,
                                "Data file (CSV with a header row of variable names, or as the options "
                                "below say); - for standard input"))
        ->type_name("FILE");
}

} // namespace

DataOptions DataWords::options() const
{
    return {textIfAny(delimiter), textsOf(columns),    textIfAny(order),   textsOf(units), textIfAny(decimal),
            textIfAny(thousands), textIfAny(encoding), textIfAny(comment), skip,           hasNoHeader,
            skipsBlankLines};
}

RenderCommand RenderWords::command() const
{
    return {textsOf(jobs),
            textOf(jobList),
            textIfAny(slice),
            onlyOutdated,
            {textOf(templateFile), textOf(templateName), textOf(table), textOf(block), textOf(data)},
            dataWords.options(),
            textsOf(outputs),
            textOf(as),
            textsOf(sets),
            textIfAny(limit),
            strict,
            textIfAny(notes),
            parents,
            progress,
            quiet};
}

CLI::App *addRender(CLI::App &program, RenderWords &words, ArgumentKinds &kinds)
{
    CLI::App *render =
        program.add_subcommand("render", "Make reports from job files, or one from a template and a data file");
    kinds.note(ArgumentKind::JobFile,
               render->add_option("JOB", words.jobs,
                                  "Job file (JSON), - for standard input; several are run one after the other"));
    kinds
        .note(ArgumentKind::File,
              render->add_option("--jobs", words.jobList,
                                 "File with the name of a job file on each line; - for standard input"))
        ->type_name("FILE");
    kinds
        .note(ArgumentKind::Text,
              render->add_option(
                  "--slice", words.slice,
                  "Run only every Nth job, beginning with the Kth, so that several processes share a list"))
        ->type_name("K/N");
    render->add_flag("--update", words.onlyOutdated,
                     "Skip a job whose outputs are newer than its job file, template and data");
    addShortForm(*render, words, kinds);
    addOutputOptions(*render, words, kinds);
    render->add_flag("--progress", words.progress, "Show the progress of the work");
    render->add_flag("--quiet", words.quiet, "Print nothing but errors");
    addDataOptions(*render, words.dataWords, kinds);
    render->footer(
        "Examples:\n"
        "  kareport render stakeout.json\n"
        "  kareport render stakeout.json -o - | less\n"
        "  kareport render stakeout.json --set settings.lengthUnit=usft -o stakeout-ft.rep\n"
        "  kareport render stakeout.json -o stakeout.xlsx -o stakeout.html\n"
        "  kareport render --template survey.xml --name CONTROL --table Points --data points.csv -o points.txt\n"
        "  total-station | kareport render -t survey.xml -n CONTROL --table Points --data - --no-header --order PNEZD\n"
        "  kareport render jobs/*.json --parents -o 'sheets/{}.pdf'\n"
        "  find jobs -name '*.json' | sort | kareport render --jobs - --slice 1/8 --update");
    return render;
}

CLI::App *addWatch(CLI::App &program, RenderWords &words, ArgumentKinds &kinds)
{
    CLI::App *watch = program.add_subcommand(
        "watch", "Make a job's reports, and again when the job, its template or its data changes");
    kinds.note(ArgumentKind::JobFile, watch->add_option("JOB", words.jobs, "Job file (JSON)"))
        ->required()
        ->expected(1)
        ->allow_extra_args(false);
    addOutputOptions(*watch, words, kinds);
    watch->add_flag("--quiet", words.quiet, "Print nothing but errors");
    watch->footer(
        "A line tells of each run: when and how long, the outputs, the number of notes. What is wrong is said, and the\n"
        "earlier outputs stay. Press Ctrl+C to stop.\n"
        "Examples:\n"
        "  kareport watch stakeout.json\n"
        "  kareport watch stakeout.json -o preview.pdf --set settings.lengthUnit=usft");
    return watch;
}

} // namespace kareport
