#include "CommandOptions.h"

#include "OutputKind.h"

#include <CLI/CLI.hpp>

namespace kareport
{

QStringList optionTexts(const std::vector<std::string> &values)
{
    QStringList list;
    for (const std::string &value : values) {
        list.append(QString::fromLocal8Bit(value.data(), static_cast<qsizetype>(value.size())));
    }
    return list;
}

QString optionText(const std::string &value)
{
    return QString::fromLocal8Bit(value.data(), static_cast<qsizetype>(value.size()));
}

std::optional<QString> optionTextIfAny(const std::optional<std::string> &value)
{
    return value ? std::optional(optionText(*value)) : std::nullopt;
}

std::string outputKindsHelp()
{
    return outputKindNames().toStdString();
}

ConvertCommand ConvertOptions::command() const
{
    return {optionText(input), optionText(output), optionText(as), optionTexts(sets), progress, quiet};
}

CLI::App *addConvert(CLI::App &program, ConvertOptions &options)
{
    CLI::App *convert =
        program.add_subcommand("convert", "Convert a saved report to another kind, by the endings of the names");
    convert->add_option("IN", options.input, "Saved report: a report file, rich text, or plain text in UTF-8")
        ->required();
    convert->add_option("OUT", options.output, "Output file; - for standard output")->required();
    convert->add_option("--as", options.as, "Kind of the output if its name does not show it: " + outputKindsHelp())
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

CheckCommand CheckOptions::command() const
{
    return {optionTexts(files), optionTexts(sets), strict, optionTextIfAny(notes), json, progress, quiet};
}

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

} // namespace kareport
