#pragma once

#include "CommandWords.h"
#include "Commands.h"

#include <CLI/CLI.hpp>

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace kareport
{

/// A word of the command line, and several.
QString textOf(const std::string &word);
QStringList textsOf(const std::vector<std::string> &words);

/// What the options take that were added to a command line, beside what its parser knows of them.
class ArgumentKinds
{
public:
    /// Notes what an option takes. @return the option
    CLI::Option *note(ArgumentKind kind, CLI::Option *option);
    /// `ArgumentKind::Flag` for an option that was not noted.
    ArgumentKind of(const CLI::Option *option) const;

private:
    std::map<const CLI::Option *, ArgumentKind> kinds_;
};

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

/// What the options of `kareport render`, and those of `kareport watch`, are read into.
struct RenderWords
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
    bool parents = false;
    bool progress = false;
    bool quiet = false;

    RenderCommand command() const;
};

/// What the options of `kareport convert` are read into.
struct ConvertWords
{
    std::string input;
    std::string output;
    std::string as;
    std::vector<std::string> sets;
    bool parents = false;
    bool progress = false;
    bool quiet = false;

    ConvertCommand command() const;
};

/// What the options of `kareport check` are read into.
struct CheckWords
{
    std::vector<std::string> files;
    std::vector<std::string> sets;
    bool strict = false;
    std::optional<std::string> notes;
    bool json = false;
    bool parents = false;
    bool progress = false;
    bool quiet = false;

    CheckCommand command() const;
};

/// What the options of `kareport templates` are read into.
struct TemplatesWords
{
    std::string file;
    std::string name;
    bool json = false;

    TemplatesCommand command() const;
};

/// What the options of `kareport new` are read into.
struct NewWords
{
    std::string folder = ".";
    bool parents = false;
    bool quiet = false;

    NewCommand command() const;
};

/// The command line: its commands, and what their words are read into.
struct CommandLine
{
    CommandLine();

    CLI::App program{"Fixed-pitch reports for civil engineering and surveying"};
    ArgumentKinds kinds;
    RenderWords render;
    RenderWords watch;
    ConvertWords convert;
    TemplatesWords templates;
    CheckWords check;
    NewWords newJob;
    std::string viewFile;
    std::string helpFor;
    std::string shell;
    CLI::App *renderCommand;
    CLI::App *watchCommand;
    CLI::App *convertCommand;
    CLI::App *templatesCommand;
    CLI::App *checkCommand;
    CLI::App *newCommand;
    CLI::App *viewCommand;
    CLI::App *helpCommand;
    CLI::App *completionCommand;

    /// All commands with all their options.
    std::vector<CommandWords> words() const;
};

CLI::App *addRender(CLI::App &program, RenderWords &words, ArgumentKinds &kinds);
CLI::App *addWatch(CLI::App &program, RenderWords &words, ArgumentKinds &kinds);

/// Adds an option that gives the kinds of outputs; one that sets keys of a job, or with `PageKey` of its page; one that makes
/// missing folders.
void addAs(CLI::App &command, std::string &as, const char *text, ArgumentKinds &kinds);
void addSets(CLI::App &command, std::vector<std::string> &sets, ArgumentKind kind, const char *text,
             ArgumentKinds &kinds);
void addParents(CLI::App &command, bool &parents);

} // namespace kareport
