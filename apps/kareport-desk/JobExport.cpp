#include "JobExport.h"

#include "DeskPreferences.h"
#include "HtmlResult.h"
#include "Interrupt.h"
#include "JobFiles.h"
#include "JobOutputs.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "ResultOutputs.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>

#include <variant>

namespace kareport
{

namespace
{

/// What keeps a job from having the file for its output.
QString wrongExport(const Job &job, const QString &path)
{
    if (const auto clash = outputClash(job, path)) {
        return clash->text;
    }
    const auto wrong = ResultOutputs::wrongResult(job);
    return wrong ? wrong->text : QString();
}

/// What keeps the further pages of a web page from being written: the user was not asked whether they may replace other files.
/// @param pages  the first one, then the others
QString wrongPage(const std::vector<Output> &pages)
{
    constexpr qint64 longestHead = 16 * 1024;
    for (std::size_t i = 1; i < pages.size(); ++i) {
        QFile file(pages[i].file);
        const bool isOurs = !file.exists() || (file.open(QIODevice::ReadOnly) &&
                                               HtmlResult::isPage(file.read(longestHead),
                                                                  QFileInfo(pages.front().file).fileName(), i + 1));
        if (!isOurs) {
            return Xlate("\"%1\" already exists and is not a page of \"%2\": choose another name")
                .arg(pages[i].file, pages.front().file);
        }
    }
    return {};
}

QString writeExport(const Job &job, const JsonSource &source, Progress &progress, QStringList &warnings)
{
    UReportDoc report(surroundingsOf(job));
    ResultOutputs results(job);
    JobRunner runner(job, source, progress);
    runner.setResults(&results);
    runner.discardUnwantedText();
    const auto wrong = runner.run(report);
    progress.finish();
    if (wrong || isInterrupted()) {
        return wrong ? wrong->message() : QString();
    }
    std::vector<Output> all = job.outputs;
    for (const Output &page : results.furtherPages()) {
        all.push_back(page);
    }
    if (const auto clash = outputClash(job, all, source.path())) {
        return clash->text;
    }
    if (const QString problem = wrongPage(all); !problem.isEmpty()) {
        return problem;
    }
    const OutputResult written =
        writeOutput(report, job.outputs.front(), progress, results.fileOf(job.outputs.front()));
    warnings = written.warnings;
    return written.problem.value_or(QString());
}

} // namespace

QString exportFilter()
{
    return Xlate("Workbook") + QStringLiteral(" (*.xlsx)|*.xlsx|") + Xlate("Web Page") +
           QStringLiteral(" (*.html)|*.html|") + Xlate("Rows as CSV") + QStringLiteral(" (*.csv)|*.csv|") +
           Xlate("Rows as JSON Lines") + QStringLiteral(" (*.jsonl)|*.jsonl||");
}

QString JobExport::open(const ReportRecipe &recipe, const QString &file)
{
    const auto kind = outputKindOf(file);
    if (!kind || !isMadeOfResults(*kind)) {
        return Xlate("\"%1\": one of the endings .xlsx, .html, .csv and .jsonl was expected").arg(file);
    }
    const auto read = sourceOf(recipe);
    if (const InputError *wrong = errorOf(read)) {
        return wrong->message();
    }
    source_ = std::make_unique<JsonSource>(std::get<JsonSource>(read));
    const auto job = readJob(*source_, loadPreferences().jobDefaults());
    if (const InputError *wrong = errorOf(job)) {
        return wrong->message();
    }
    job_ = std::make_unique<Job>(std::get<Job>(job));
    // Of the job's own outputs, the one of the kind says which rows are wanted, and how.
    for (const Output &own : job_->outputs) {
        if (own.kind == *kind) {
            own_.push_back(own);
        }
    }
    Output output{file, *kind};
    if (!own_.empty()) {
        output.results = own_.front().results;
    }
    job_->outputs.clear();
    job_->outputs.push_back(output);
    if (isOfOneTable(*kind)) {
        findChoices();
    }
    return choices_.isEmpty() ? wrongExport(*job_, source_->path()) : QString();
}

/// Finds what the file may have the rows of.
void JobExport::findChoices()
{
    Output &output = job_->outputs.front();
    const ResultOptions any;
    const ResultOptions &wanted = own_.size() > 1 ? any : output.results; // several may be of several tables
    steps_ = ResultOutputs::possibleSteps(*job_, wanted);
    if (steps_.size() < 2) {
        return;
    }
    output.results = wanted;
    for (const std::size_t step : steps_) {
        const auto &action = job_->steps[step].action;
        const auto *table = std::get_if<Job::Table>(&action);
        const auto *block = std::get_if<Job::Block>(&action);
        choices_.append(QStringLiteral("%1 (%2)").arg(table != nullptr ? table->name : block->name,
                                                      table != nullptr ? table->data : block->data));
    }
}

void JobExport::choose(std::size_t choice)
{
    Output &output = job_->outputs.front();
    for (const Output &own : own_) { // which may say how the rows of this one are written
        if (ResultOutputs::possibleSteps(*job_, own.results) == std::vector<std::size_t>{steps_[choice]}) {
            output.results = own.results;
        }
    }
    output.results.step = steps_[choice];
}

QString JobExport::write(Progress &progress, QStringList &warnings) const
{
    const QString wrong = wrongExport(*job_, source_->path());
    return !wrong.isEmpty() ? wrong : writeExport(*job_, *source_, progress, warnings);
}

} // namespace kareport
