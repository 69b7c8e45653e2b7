#pragma once

#include "JobFolder.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "ReportFixture.h"
#include "TemplateMarkup.h"

#include <gtest/gtest.h>

#include <memory>

namespace jobs
{

/// A template "T" of the title "Title". Tables: "Points" (number and northing), "Sorted" (the same by northing, then
/// number), "Stations", and "Lost", whose dictionary is missing. Blocks: "Site" and "Point".
QByteArray pointsTemplate(const char *title = "Title");

/// What a job file's text begins with: a fixed time and page.
inline const char *const fixedFront =
    R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80}, )";

/// A job that runs in a folder of its own, which has the template file t.xml.
class TestJob
{
public:
    TestJob() { folder.put("t.xml", pointsTemplate()); }

    /// Runs a job of this content after `fixedFront`.
    void run(const QByteArray &content) { runWhole(fixedFront + content + '}'); }
    void runWhole(const QByteArray &json);

    UReportDoc &report() { return *report_; }
    /// The report's text with LF for its line ends; the message when there is none.
    QString text();

private:
    FixedSurroundings surroundings_;

public:
    JobFolder folder;
    std::optional<kareport::InputError> error;
    kareport::JobNotes notes;
    bool measures = false; ///< whether the next run measures how the data fits
    std::vector<kareport::StepFit> fits;

private:
    std::unique_ptr<UReportDoc> report_;
};

/// A template step's front for jobs: no header, the template, the data sets and the steps.
inline QByteArray templateJob(const QByteArray &data, const QByteArray &steps, const QByteArray &more = {})
{
    return more + R"("header": false, "template": {"file": "t.xml", "name": "T"}, "data": {)" + data +
           R"(}, "report": [)" + steps + "]";
}

} // namespace jobs
