#pragma once

#include "Commands.h"
#include "Job.h"
#include "JobNotes.h"
#include "JobRunner.h"
#include "JsonSource.h"
#include "OutputFolders.h"
#include "Progress.h"
#include "UReportDoc.h"

#include <optional>

namespace kareport
{

/// A job with all that the command line says about it.
class CommandLineJob
{
public:
    /// Reads a job. Errors are reported on standard error and in `status`.
    CommandLineJob(const RenderCommand &command, Expected<JsonSource> source);

    /// `exitDone` while nothing is wrong with the job.
    ExitStatus status() const { return status_; }
    const Job &job() const { return job_; }
    /// How many notes there are on the report that was made.
    qsizetype noteCount() const { return static_cast<qsizetype>(notes_.said().size()); }
    /// Says that the job cannot be used, before anything of it was written.
    void fail(const QString &text);
    /// Whether the job needs a running QGuiApplication.
    bool needsFonts() const;
    /// Makes the report and writes its outputs.
    ExitStatus run(Progress &progress);

private:
    /// How making the report ended, before its outputs are looked at.
    ExitStatus madeStatus(const UReportDoc &report, const std::optional<InputError> &error);
    std::optional<ExitStatus> runIntoOutput(JobRunner &runner, UReportDoc &report, const Output &output,
                                            Progress &progress);
    std::optional<InputError> make(JobRunner &runner, UReportDoc &report, ReportTextWriter *stream);
    bool isStrict() const { return command_.strict || job_.strict; }
    void sayNotes(const std::optional<InputError> &error);
    ExitStatus checkCharacters(UReportDoc &report, Progress &progress);
    ExitStatus withNotes(ExitStatus status) const;
    QString notesFile() const;
    void takeOutputs(std::optional<OutputKind> kindOtherwise);
    void checkOutputs();
    ExitStatus checkSize();
    void checkPages(const ResultOutputs &results);
    bool isReaderGone() const;
    ExitStatus failTooLarge(qint64 bytes);
    ExitStatus fail(ExitStatus status, const QString &message);

    const RenderCommand &command_;
    JsonSource source_;
    Job job_;
    ExitStatus status_ = exitDone;
    OutputFolders folders_;
    JobNotes notes_;        ///< on the report
    bool hasNotes_ = false; ///< it came to them
};

} // namespace kareport
