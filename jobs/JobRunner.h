#pragma once

#include "InputError.h"
#include "Job.h"
#include "JobNotes.h"
#include "JsonSource.h"
#include "Placeholders.h"
#include "Progress.h"
#include "ReportSurroundings.h"
#include "ResultOutputs.h"
#include "StepFit.h"
#include "UReportDoc.h"
#include "WrittenCells.h"

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// What the report of a job is made in: the job says all of it, so that what is printed does not depend on the preferences,
/// the printer and the clock of the user who runs it. A job without a time has that of a reproducible build, if one
/// gives it (SOURCE_DATE_EPOCH), else the host's.
ReportSurroundings surroundingsOf(const Job &job);

/// How often making the report of a job begins to read data.
std::size_t readingsOf(const Job &job);

/// Makes a report as a job describes it.
class JobRunner
{
public:
    /// @param source    the job file, for its values and for the places of errors
    /// @param progress  shows how far reading the job's data has come
    JobRunner(const Job &job, const JsonSource &source, Progress &progress)
        : job_(job), source_(source), progress_(progress)
    {}

    /// Sets what is asked now and then, besides the interrupts, whether the work is to stop.
    void stopWhen(std::function<bool()> isToStop) { isToStop_ = std::move(isToStop); }

    /// Has it go on when the program is asked to stop its work (`isInterrupted`): what stops it is `stopWhen` alone.
    void ignoreInterrupts() { heedsInterrupts_ = false; }
    /// Says what receives where the report shows the fields of its tables and blocks; null for none. It must outlive the
    /// runs. The text is not to be handed on meanwhile.
    void setCells(WrittenCells *cells) { cells_ = cells; }

    /// Makes a note an error: the report is not made then, and the notes so far are kept.
    void beStrict() { isStrict_ = true; }
    /// Has it measured how the data of each step fits its table or block. Off by default: it takes time.
    void measure() { isMeasuring_ = true; }
    /// Says which outputs receive the values that are written. They must outlive the runs; null for none.
    void setResults(ResultOutputs *results) { results_ = results; }
    /// Has the report keep no text where only the values are wanted (`ResultOutputs::isTextUnwanted`).
    void discardUnwantedText() { discardsText_ = true; }
    /// How the steps of the report that was made last fit, in their order, those alone that were written.
    const std::vector<StepFit> &fits() const { return fits_; }
    /// The notes on the report that was made last, also on one that was not finished.
    const JobNotes &notes() const { return notes_; }

    /// Writes the job's report. Its surroundings are the job's until it has been written; then those that it had before
    /// apply again, except for margins and font size. Writing stops when it is larger than an output of the job may be.
    /// @param report  a new one, which must stay open. In a program whose preferences must not matter it is made with
    ///                `surroundingsOf` the job
    /// @param stream  receives the text while it is written, where no step takes text back; null keeps it in the report.
    ///                Once it has failed, no more is made. What the report still holds of it at the end is handed on by
    ///                `UReportDoc::EndTextStream`
    /// @return what is wrong with the job's template or data; nothing when the report has been made or the work was stopped
    /// @throws std::bad_alloc when memory runs out: half a report counts as none
    std::optional<InputError> run(UReportDoc &report, ReportTextWriter *stream = nullptr);

private:
    std::optional<InputError> prepare(UReportDoc &report);
    std::optional<InputError> loadTemplate(UReportDoc &report);
    void applyOptions(UReportDoc &report);

    const Job &job_;
    const JsonSource &source_;
    Progress &progress_;
    std::function<bool()> isToStop_;
    ResultOutputs *results_ = nullptr;
    WrittenCells *cells_ = nullptr;
    bool heedsInterrupts_ = true;
    bool isStrict_ = false;
    bool isMeasuring_ = false;
    bool discardsText_ = false;
    std::vector<StepFit> fits_;
    std::unique_ptr<Placeholders> placeholders_; ///< of the job's texts; null where they have none
    JobNotes notes_;
};

} // namespace kareport
