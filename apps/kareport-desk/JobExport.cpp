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

QString exportJob(const ReportRecipe &recipe, const QString &file, Progress &progress, QStringList &warnings)
{
    const auto kind = outputKindOf(file);
    if (!kind || !isMadeOfResults(*kind)) {
        return Xlate("\"%1\": one of the endings .xlsx, .html, .csv and .jsonl was expected").arg(file);
    }
    const auto read = sourceOf(recipe);
    if (const InputError *wrong = errorOf(read)) {
        return wrong->message();
    }
    const auto &source = std::get<JsonSource>(read);
    auto job = readJob(source, loadPreferences().jobDefaults());
    if (const InputError *wrong = errorOf(job)) {
        return wrong->message();
    }
    // Of the job's own outputs, the one of the kind says which rows are wanted, and how.
    Output output{file, *kind};
    for (const Output &own : std::get<Job>(job).outputs) {
        if (own.kind == *kind) {
            output.results = own.results;
            break;
        }
    }
    std::get<Job>(job).outputs.clear();
    std::get<Job>(job).outputs.push_back(output);
    const QString wrong = wrongExport(std::get<Job>(job), source.path());
    return !wrong.isEmpty() ? wrong : writeExport(std::get<Job>(job), source, progress, warnings);
}

} // namespace kareport
