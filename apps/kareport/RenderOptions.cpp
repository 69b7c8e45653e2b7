#include "CommandOptions.h"

#include <CLI/CLI.hpp>

namespace kareport
{

namespace
{

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

} // namespace

DataOptions DataWords::options() const
{
    return {optionTextIfAny(delimiter),
            optionTexts(columns),
            optionTextIfAny(order),
            optionTexts(units),
            optionTextIfAny(decimal),
            optionTextIfAny(thousands),
            optionTextIfAny(encoding),
            optionTextIfAny(comment),
            skip,
            hasNoHeader,
            skipsBlankLines};
}

RenderCommand RenderOptions::command() const
{
    return {
        optionTexts(jobs),
        optionText(jobList),
        optionTextIfAny(slice),
        onlyOutdated,
        {optionText(templateFile), optionText(templateName), optionText(table), optionText(block), optionText(data)},
        dataWords.options(),
        optionTexts(outputs),
        optionText(as),
        optionTexts(sets),
        optionTextIfAny(limit),
        strict,
        optionTextIfAny(notes),
        progress,
        quiet};
}

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
    render->add_option("--as", options.as, "Kind of the outputs whose names do not show it: " + outputKindsHelp())
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

} // namespace kareport
