#include "JobRunnerFixture.h"

namespace jobs
{

QByteArray pointsTemplate(const char *title)
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

void TestJob::runWhole(const QByteArray &json)
{
    report_.reset();
    error.reset();
    folder.put("job.json", json);
    const auto source = kareport::JsonSource::read(folder.path("job.json"));
    if (const auto *wrong = kareport::errorOf(source)) {
        error = *wrong;
        return;
    }
    const auto read = kareport::readJob(std::get<kareport::JsonSource>(source));
    if (const auto *wrong = kareport::errorOf(read)) {
        error = *wrong;
        return;
    }
    const auto &job = std::get<kareport::Job>(read);
    report_ = std::make_unique<UReportDoc>(kareport::surroundingsOf(job));
    kareport::Progress progress(false);
    kareport::JobRunner runner(job, std::get<kareport::JsonSource>(source), progress);
    if (measures) {
        runner.measure();
    }
    error = runner.run(*report_);
    notes = runner.notes();
    fits = runner.fits();
}

QString TestJob::text()
{
    if (error) {
        return error->message();
    }
    return report().GetText().toString().replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
}

} // namespace jobs
