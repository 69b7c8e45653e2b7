#include "RenderJob.h"

#include "CommandSetup.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "OutputsWriter.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

RenderJob::RenderJob(const RenderCommand &command, Expected<JsonSource> source) : command_(command)
{
    if (const InputError *error = errorOf(source)) {
        fail(exitInput, error->message());
        return;
    }
    source_ = std::move(std::get<JsonSource>(source));
    if (const auto wrong = applySets(source_, command.sets)) {
        fail(exitUsage, QStringLiteral("kareport: ") + *wrong);
        return;
    }
    const auto kindOtherwise = outputKindFromName(command.as);
    job_ = readJob(source_, kindOtherwise);
    if (source_.error()) {
        fail(exitInput, source_.error()->message());
        return;
    }
    takeOutputs(kindOtherwise);
}

void RenderJob::takeOutputs(std::optional<OutputKind> kindOtherwise)
{
    if (!command_.outputs.isEmpty()) {
        job_.outputs.clear();
        for (QString file : command_.outputs) {
            if (!source_.path().isEmpty()) {
                file.replace(QStringLiteral("{}"), QFileInfo(source_.path()).completeBaseName());
            }
            job_.outputs.push_back({file, *outputKindOf(file, kindOtherwise)});
        }
    } else if (job_.outputs.empty()) {
        job_.outputs.push_back({QStringLiteral("-"), *outputKindOf(QStringLiteral("-"), kindOtherwise)});
    }
}

bool RenderJob::needsFonts() const
{
    return JobRunner::needsFonts(job_) || kareport::needsFonts(job_.outputs);
}

void RenderJob::fail(const QString &text)
{
    fail(exitInput, InputError{source_.path(), std::nullopt, text}.message());
}

ExitStatus RenderJob::fail(ExitStatus status, const QString &message)
{
    printError(message);
    status_ = status;
    return status;
}

ExitStatus RenderJob::run(Progress &progress)
{
    JobRunner runner(job_, source_, progress);
    const auto error = runner.run();
    progress.finish();
    if (isInterrupted()) {
        if (!command_.isBatch()) {
            printError(Xlate("kareport: stopped; nothing was written"));
        }
        return status_ = exitInterrupted;
    }
    if (error) {
        return fail(exitInput, error->message());
    }
    return status_ = writeOutputs(runner.report(), job_.outputs, progress, command_.quiet);
}

} // namespace kareport
