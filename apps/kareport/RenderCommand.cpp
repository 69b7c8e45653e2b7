#include "Commands.h"

#include "CommandLineJob.h"
#include "CommandSetup.h"
#include "JobFiles.h"
#include "JobList.h"
#include "NotesFile.h"
#include "RenderBatch.h"
#include "SizeLimit.h"
#include "TerminalProgress.h"
#include "Xlate.h"

namespace kareport
{

bool RenderCommand::isShort() const
{
    const TemplateJob &job = templateJob;
    return !job.templateFile.isEmpty() || !job.templateName.isEmpty() || !job.table.isEmpty() || !job.block.isEmpty() ||
           !job.data.isEmpty() || !dataOptions.isEmpty();
}

bool RenderCommand::isBatch() const
{
    return jobs.size() > 1 || !jobList.isEmpty() || slice;
}

std::optional<QString> RenderCommand::usageError() const
{
    auto wrong = wrongSource();
    wrong = wrong ? wrong : wrongKindName(as);
    if (!wrong && limit && !sizeFromText(*limit)) {
        return Xlate("--limit \"%1\": a number of bytes was expected, such as 500000, 800K, 20M or 1G").arg(*limit);
    }
    return wrong ? wrong : wrongOutputs();
}

std::optional<QString> RenderCommand::wrongSource() const
{
    const TemplateJob &job = templateJob;
    if ((jobs.isEmpty() && jobList.isEmpty()) != isShort()) {
        return Xlate("either job files or --template, --name, --table or --block, and --data were expected");
    }
    if (isShort() && (job.templateFile.isEmpty() || job.templateName.isEmpty() || job.data.isEmpty() ||
                      job.table.isEmpty() == job.block.isEmpty()))
    {
        return Xlate("--template, --name, --data and one of --table and --block were expected");
    }
    if (const auto wrong = dataOptions.usageError()) {
        return wrong;
    }
    if (jobs.contains(QStringLiteral("-")) && jobList == u"-") {
        return Xlate("standard input is the list of jobs: no job is read from it");
    }
    if (isShort() && slice) {
        return Xlate("--slice takes a part of several job files: job files were expected");
    }
    if (slice && !JobSlice::fromText(*slice)) {
        return Xlate("--slice \"%1\": a number, a slash and the count of slices were expected, such as 3/8")
            .arg(*slice);
    }
    return std::nullopt;
}

std::optional<QString> RenderCommand::wrongOutputs() const
{
    for (const QString &file : outputs) {
        if (auto wrong = wrongOutput(file, as)) {
            return wrong;
        }
        if (isBatch() && file != u"-" && !file.contains(QStringLiteral("{}"))) {
            return Xlate("-o \"%1\" is one file for several jobs: a name with {} was expected, which is "
                         "replaced by the name of the job file")
                .arg(file);
        }
    }
    return wrongNotesFile(notes, isBatch());
}

/// The job file, or the job that the short form describes.
Expected<JsonSource> RenderCommand::readSource() const
{
    if (!isShort()) {
        return JsonSource::read(jobs.first());
    }
    TemplateJob job = templateJob;
    job.dataOptions = dataOptions.toJson();
    JsonSource source = JsonSource::fromObject(job.toJson());
    dataOptions.nameIn(source, QStringLiteral("data.data"));
    return source;
}

ExitStatus RenderCommand::run(int &argc, char **argv) const
{
    if (isBatch()) {
        QStringList all = jobs;
        if (!jobList.isEmpty()) {
            const auto listed = readJobList(jobList);
            if (const InputError *error = errorOf(listed)) {
                printError(error->message());
                return exitInput;
            }
            all += std::get<QStringList>(listed);
        }
        const auto application = startQt(argc, argv, true);
        RenderBatch batch(*this);
        batch.keep(all, jobList);
        return batch.run(slice ? JobSlice::fromText(*slice)->of(all) : all);
    }
    CommandLineJob job(*this, readSource());
    if (job.status() != exitDone) {
        return job.status();
    }
    TerminalProgress bar(progress);
    if (onlyOutdated && isUpToDate(job.job(), isShort() ? QString() : jobs.first())) {
        bar.complete();
        if (!quiet) {
            printError(Xlate("kareport: all is up to date; nothing was written"));
        }
        return exitDone;
    }
    const auto application = startQt(argc, argv, job.needsFonts());
    const ExitStatus status = job.run(bar);
    if (status == exitDone) {
        bar.complete();
    }
    return status;
}

} // namespace kareport
