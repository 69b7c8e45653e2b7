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
inline QByteArray pointsTemplate(const char *title = "Title")
{
    using namespace markup;
    const QByteArray site = element(
        "Dictionary", element("DictionaryName", "Site") +
                          element("VariableList", joined({variable(1, "Client", "TEXT"), variable(2, "Area", "AREA"),
                                                          variable(3, "Bearing", "BEARING")})));
    const std::vector<QByteArray> points = {field("Number", "Pt", "5"), field("Northing", "North", "9.3", "RIGHT")};
    const QByteArray tables = output("Table", "Points", "Survey", points) +
                              output("Table", "Sorted", "Survey", points, {"Northing", "Number"}) +
                              output("Table", "Stations", "Survey", {field("Chainage", "Chainage", "12.3", "RIGHT")}) +
                              output("Table", "Lost", "Nowhere", points);
    const QByteArray blocks =
        output("Block", "Site", "Site",
               {field("Client", "Client", "0"), field("Area", "Area", "0.3"), field("Bearing", "Bearing", "0")}) +
        output("Block", "Point", "Survey", points);
    return element("ReportTemplate", element("Name", "T") + element("Title", title) + element("Tables", tables) +
                                         element("Dictionaries", surveyDictionary() + site) +
                                         element("Blocks", blocks) + element("Options", separatorOption("124")));
}

/// What a job file's text begins with: a fixed time and page.
inline const char *const fixedFront =
    R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80}, )";

/// A job that runs in a folder of its own, which has the template file t.xml.
class TestJob
{
public:
    TestJob() { folder.put("t.xml", pointsTemplate()); }

    /// Runs a job of this content behind `fixedFront`.
    void run(const QByteArray &content) { runWhole(fixedFront + content + '}'); }
    void runWhole(const QByteArray &json)
    {
        runner_.reset();
        error.reset();
        folder.put("job.json", json);
        auto read = kareport::JsonSource::read(folder.path("job.json"));
        if (const auto *wrong = kareport::errorOf(read)) {
            error = *wrong;
            return;
        }
        source_ = std::make_unique<kareport::JsonSource>(std::get<kareport::JsonSource>(std::move(read)));
        job_ = kareport::readJob(*source_);
        error = source_->error();
        if (error) {
            return;
        }
        runner_ = std::make_unique<kareport::JobRunner>(job_, *source_, progress_);
        error = runner_->run();
    }

    UReportDoc &report() { return runner_->report(); }
    /// The report's text with LF for its line ends; the message when there is none.
    QString text()
    {
        if (error) {
            return error->message();
        }
        return report().GetText().toString().replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    }

private:
    FixedSurroundings surroundings_;

public:
    JobFolder folder;
    std::optional<kareport::InputError> error;

private:
    kareport::Progress progress_{false};
    kareport::Job job_;
    std::unique_ptr<kareport::JsonSource> source_;
    std::unique_ptr<kareport::JobRunner> runner_;
};

/// A template step's front for jobs: no header, the template, the data sets and the steps.
inline QByteArray templateJob(const QByteArray &data, const QByteArray &steps, const QByteArray &more = {})
{
    return more + R"("header": false, "template": {"file": "t.xml", "name": "T"}, "data": {)" + data +
           R"(}, "report": [)" + steps + "]";
}

} // namespace jobs
