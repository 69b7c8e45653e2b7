#pragma once

#include "Commands.h"

#include <optional>
#include <string>
#include <vector>

namespace CLI
{
class App;
}

namespace kareport
{

/// The text of a word of the command line.
QString optionText(const std::string &value);
QStringList optionTexts(const std::vector<std::string> &values);
std::optional<QString> optionTextIfAny(const std::optional<std::string> &value);
/// The names of the kinds of outputs, for the help.
std::string outputKindsHelp();

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

    DataOptions options() const;
};

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

    RenderCommand command() const;
};

/// Adds the command. The options must live until the command line has been parsed.
CLI::App *addRender(CLI::App &program, RenderOptions &options);

/// What the options of `kareport convert` are read into.
struct ConvertOptions
{
    std::string input;
    std::string output;
    std::string as;
    std::vector<std::string> sets;
    bool progress = false;
    bool quiet = false;

    ConvertCommand command() const;
};

/// Adds the command, as `addRender`.
CLI::App *addConvert(CLI::App &program, ConvertOptions &options);

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

    CheckCommand command() const;
};

/// Adds the command, as `addRender`.
CLI::App *addCheck(CLI::App &program, CheckOptions &options);

} // namespace kareport
