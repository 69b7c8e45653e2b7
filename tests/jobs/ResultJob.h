#pragma once

#include "JobRunnerFixture.h"
#include "ResultOutputs.h"

#include <QFileInfo>

#include <map>

namespace jobs
{

/// A job in a folder of its own that is run once, with the files that are made of its results.
class ResultJob
{
public:
    ResultJob() { folder.put("t.xml", pointsTemplate()); }

    /// Runs a job of this content after `fixedFront`.
    void run(const QByteArray &content) { runWhole(fixedFront + content + '}'); }
    void runWhole(const QByteArray &json)
    {
        files.clear();
        text.clear();
        error = runJob(json);
    }
    /// The bytes of an output as text; the message when there are none.
    std::string bytes(const char *name) const
    {
        const auto found = files.find(name);
        return found != files.end() ? found->second : error.toStdString();
    }

private:
    FixedSurroundings surroundings_;

    QString runJob(const QByteArray &json)
    {
        using namespace kareport;
        folder.put("job.json", json);
        const auto source = JsonSource::read(folder.path("job.json"));
        if (const auto *wrong = errorOf(source)) {
            return wrong->message();
        }
        const auto read = readJob(std::get<JsonSource>(source));
        if (const auto *wrong = errorOf(read)) {
            return wrong->message();
        }
        const auto &job = std::get<Job>(read);
        if (const auto wrong = ResultOutputs::wrongResult(job)) {
            return std::get<JsonSource>(source)
                .errorAt({QStringLiteral("output"), wrong->output}, wrong->text)
                .message();
        }
        UReportDoc report(surroundingsOf(job));
        Progress progress(false);
        ResultOutputs results(job);
        JobRunner runner(job, std::get<JsonSource>(source), progress);
        runner.setResults(&results);
        if (discardsText) {
            runner.discardUnwantedText();
        }
        const auto wrong = runner.run(report);
        notes = runner.notes();
        if (wrong) {
            return wrong->message();
        }
        text = report.GetText().toString();
        for (const Output &output : job.outputs) {
            if (ResultFile *file = results.fileOf(output)) {
                EXPECT_TRUE(file->finish()) << file->problem().toStdString();
                const std::string name = QFileInfo(output.file).fileName().toStdString();
                files[name] = std::string(file->bytes());
                warnings[name] = file->warnings();
            }
        }
        return {};
    }

public:
    JobFolder folder;
    QString error;
    QString text;              ///< of the report
    bool discardsText = false; ///< whether the report keeps no text that nobody wants
    kareport::JobNotes notes;
    std::map<std::string, std::string> files;
    std::map<std::string, QStringList> warnings; ///< of the outputs
};

} // namespace jobs
