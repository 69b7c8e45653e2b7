#pragma once

#include "DataOptions.h"
#include "Job.h"
#include "Printing.h"

#include <QString>
#include <QStringList>

#include <optional>

namespace kareport
{

/// The exit status of the program.
enum ExitStatus
{
    exitDone = 0,
    exitUsage = 1,        ///< the command line is wrong
    exitInput = 2,        ///< the job, a template or data is wrong; nothing was written
    exitOutput = 3,       ///< an output could not be written; an existing file keeps its content
    exitInterrupted = 130 ///< stopped by a signal, which then ends the program; nothing is half written
};

/// `kareport render`
struct RenderCommand
{
    QStringList jobs;             ///< job files; "-" for one on standard input
    QString jobList;              ///< a file that names job files; "-" for standard input, empty for none
    std::optional<QString> slice; ///< "3/8" for the third of eight parts of all these jobs; none for all of them
    bool onlyOutdated = false;    ///< leave jobs out whose outputs are up to date
    TemplateJob templateJob;      ///< the short form: no job file
    DataOptions dataOptions;      ///< of the short form
    QStringList outputs;
    QString as;
    QStringList sets;
    std::optional<QString> limit; ///< "10M" for the size that no output may exceed
    bool strict = false;          ///< notes are errors
    std::optional<QString> notes; ///< a file that notes are written to, as JSON
    bool parents = false;         ///< make the folders of the outputs
    bool progress = false;
    bool quiet = false;

    /// What is wrong with the options together; nothing when they make sense.
    std::optional<QString> usageError() const;
    /// `argc` and `argv` are the program's own, for Qt.
    ExitStatus run(int &argc, char **argv) const;

    /// Whether it is for any number of jobs.
    bool isBatch() const;

private:
    bool isShort() const;
    std::optional<QString> wrongSource() const;
    Expected<JsonSource> readSource() const;
    std::optional<QString> wrongOutputs() const;
};

/// `kareport convert`
struct ConvertCommand
{
    QString input;
    QString output;
    QString as;
    QStringList sets;     ///< keys of the page
    bool parents = false; ///< make the folder of the output
    bool progress = false;
    bool quiet = false;

    std::optional<QString> usageError() const;
    ExitStatus run(int &argc, char **argv) const;
};

/// `kareport templates`
struct TemplatesCommand
{
    QString file;
    QString name; ///< empty to list the file's templates
    bool json = false;

    ExitStatus run() const;
};

/// `kareport check`
struct CheckCommand
{
    QStringList files;            ///< template files and job files; "-" for a job on standard input
    QStringList sets;             ///< keys of the jobs
    bool strict = false;          ///< what render would note is an error
    std::optional<QString> notes; ///< a file that the notes on a job are written to, as JSON
    bool json = false;
    bool parents = false; ///< make the folder of the notes
    bool progress = false;
    bool quiet = false; ///< errors alone

    /// What is wrong with the options together; nothing when they make sense.
    std::optional<QString> usageError() const;
    /// `argc` and `argv` are the program's own, for Qt.
    ExitStatus run(int &argc, char **argv) const;
};

/// `kareport new`
struct NewCommand
{
    QString folder;       ///< its name becomes that of the files; it is made if it is not there
    bool parents = false; ///< make the folders that it is in as well
    bool quiet = false;

    /// Writes a template, data and a job that makes a report of them. Nothing that is there is replaced.
    ExitStatus run() const;
};

/// `kareport watch`
struct WatchCommand
{
    RenderCommand render; ///< of one job file

    /// What is wrong with the options together; nothing when they make sense.
    std::optional<QString> usageError() const;
    /// `argc` and `argv` are the program's own, for Qt.
    ExitStatus run(int &argc, char **argv) const;
};

/// `kareport view`
struct ViewCommand
{
    QString file;

    /// Starts the desktop program and does not wait for it.
    ExitStatus run(int &argc, char **argv) const;
};

} // namespace kareport
