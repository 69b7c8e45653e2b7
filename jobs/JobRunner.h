#pragma once

#include "InputError.h"
#include "Job.h"
#include "JobSurroundings.h"
#include "JsonNode.h"
#include "Progress.h"
#include "UApplication.h"
#include "UReportDoc.h"

#include <functional>
#include <memory>
#include <optional>

namespace kareport
{

/// Makes the report that a job describes: in the application where there is one, else without windows.
class JobRunner
{
public:
    /// Makes an empty report, whose title is set later. @return null when it cannot be made
    using MakeReport = std::function<UReportDoc *(bool header)>;

    /// @param source  the job file, for its values and for the places of errors
    /// @param make    makes the report; empty for one in a pane of its own, where the application has panes
    JobRunner(const Job &job, JsonSource &source, Progress &progress, MakeReport make = {});
    ~JobRunner();

    /// Whether a page has to be measured with a font, which needs a running QGuiApplication.
    static bool needsFonts(const Job &job) { return !job.page.linesPerPage || !job.page.charsPerRow; }

    /// @param stream  receives the text while it is written, where no step takes text back; null keeps it in the report. Once
    ///                it has failed, no more is made
    /// @return what is wrong with the job's template or data; nothing when the report has been made or was interrupted
    std::optional<InputError> run(ReportTextWriter *stream = nullptr);
    /// Is asked now and then, besides the interrupts, whether the work is to stop.
    void stopWhen(std::function<bool()> isToStop) { isToStop_ = std::move(isToStop); }
    UReportDoc &report() { return *report_; }
    /// The same while it may not have been made: null then.
    UReportDoc *madeReport() { return report_; }

private:
    class Steps;

    std::optional<InputError> prepare();
    std::optional<InputError> loadTemplate();
    void applyOptions();
    bool isStopped() const;

    const Job &job_;
    JsonSource &source_;
    Progress &progress_;
    JobSurroundings surroundings_;
    MakeReport make_;
    std::optional<UApplication> application_; ///< of a program that has none
    UReportDoc *report_ = nullptr;            ///< owned by its document template
    ReportTextWriter *stream_ = nullptr;
    std::function<bool()> isToStop_;
};

} // namespace kareport
