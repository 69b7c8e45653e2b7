#include "Commands.h"

#include "CommandSetup.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "OutputsWriter.h"
#include "Xlate.h"

namespace kareport
{

std::optional<QString> RenderCommand::usageError() const
{
    const auto &[templateFile, templateName, table, block, data] = templateJob;
    const bool isShort =
        !templateFile.isEmpty() || !templateName.isEmpty() || !table.isEmpty() || !block.isEmpty() || !data.isEmpty();
    if (job.isEmpty() != isShort) {
        return Xlate("either a job file or --template, --name, --table or --block, and --data were expected");
    }
    if (isShort &&
        (templateFile.isEmpty() || templateName.isEmpty() || data.isEmpty() || table.isEmpty() == block.isEmpty()))
    {
        return Xlate("--template, --name, --data and one of --table and --block were expected");
    }
    if (const auto wrong = wrongKindName(as)) {
        return wrong;
    }
    for (const QString &file : outputs) {
        if (const auto wrong = wrongOutput(file, as)) {
            return wrong;
        }
    }
    return std::nullopt;
}

ExitStatus RenderCommand::run(int &argc, char **argv) const
{
    auto read =
        job.isEmpty() ? Expected<JsonSource>(JsonSource::fromObject(templateJob.toJson())) : JsonSource::read(job);
    if (const InputError *error = errorOf(read)) {
        printError(error->message());
        return exitInput;
    }
    auto &source = std::get<JsonSource>(read);
    if (const auto wrong = applySets(source, sets)) {
        return usageExit(*wrong);
    }
    const auto kindOtherwise = outputKindFromName(as);
    Job readyJob = readJob(source, kindOtherwise);
    if (source.error()) {
        printError(source.error()->message());
        return exitInput;
    }
    if (!outputs.isEmpty()) {
        readyJob.outputs.clear();
        for (const QString &file : outputs) {
            readyJob.outputs.push_back({file, *outputKindOf(file, kindOtherwise)});
        }
    } else if (readyJob.outputs.empty()) {
        readyJob.outputs.push_back({QStringLiteral("-"), *outputKindOf(QStringLiteral("-"), kindOtherwise)});
    }

    const auto application = startQt(argc, argv, JobRunner::needsFonts(readyJob) || needsFonts(readyJob.outputs));
    Progress bar(progress);
    JobRunner runner(readyJob, source, bar);
    const auto error = runner.run();
    bar.finish();
    if (isInterrupted()) {
        printError(Xlate("kareport: stopped; nothing was written"));
        return exitInterrupted;
    }
    if (error) {
        printError(error->message());
        return exitInput;
    }
    return writeOutputs(runner.report(), readyJob.outputs, bar, quiet);
}

} // namespace kareport
