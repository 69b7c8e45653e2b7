#include "Commands.h"

#include "Interrupt.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "OutputWriter.h"
#include "Xlate.h"

#include <QDir>
#include <QGuiApplication>
#include <QJsonArray>
#include <QJsonObject>

namespace kareport
{

namespace
{

/// The job that the short form of the command line stands for.
QJsonObject shortJob(const RenderCommand &command)
{
    const QString set = QStringLiteral("data");
    const bool isTable = !command.table.isEmpty();
    const QJsonObject step = {
        {isTable ? QStringLiteral("table") : QStringLiteral("block"), isTable ? command.table : command.block},
        {set, set}};
    return {{QStringLiteral("template"), QJsonObject{{QStringLiteral("file"), command.templateFile},
                                                     {QStringLiteral("name"), command.templateName}}},
            {set, QJsonObject{{set, QJsonObject{{QStringLiteral("csv"), command.data}}}}},
            {QStringLiteral("report"), QJsonArray{step}}};
}

ExitStatus usage(const QString &text)
{
    printError(QStringLiteral("kareport: ") + text);
    return exitUsage;
}

std::optional<QString> applySets(JsonSource &source, const QStringList &sets)
{
    for (const QString &set : sets) {
        const qsizetype equals = set.indexOf(u'=');
        if (equals < 1) {
            return Xlate("--set \"%1\": KEY=VALUE was expected").arg(set);
        }
        if (const auto wrong = source.set(set.left(equals), set.mid(equals + 1))) {
            return *wrong;
        }
    }
    return std::nullopt;
}

ExitStatus writeOutputs(UReportDoc &report, const Job &job, Progress &progress, bool quiet)
{
    ExitStatus status = exitDone;
    for (const Output &output : job.outputs) {
        if (isInterrupted()) {
            printError(Xlate("kareport: stopped before \"%1\" was written").arg(output.file));
            return exitInterrupted;
        }
        if (!output.isStandardOutput()) {
            progress.begin(Xlate("Writing %1").arg(output.file), 0);
        }
        const auto error = writeOutput(report, output);
        progress.finish();
        if (error) {
            printError(QStringLiteral("kareport: ") + *error);
            status = exitOutput;
        } else if (!quiet && report.IsEmpty() && output.kind == OutputKind::Report) {
            printError(Xlate("kareport: the report is empty: \"%1\" was not written").arg(output.file));
        }
    }
    return status;
}

} // namespace

std::optional<QString> RenderCommand::usageError() const
{
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
    if (!as.isEmpty() && !outputKindFromName(as)) {
        return Xlate("--as: one of %1 was expected").arg(outputKindNames());
    }
    for (const QString &file : outputs) {
        if (!outputKindOf(file, outputKindFromName(as))) {
            return Xlate("the ending of \"%1\" says no kind: --as with one of %2 was expected")
                .arg(file, outputKindNames());
        }
    }
    return std::nullopt;
}

ExitStatus RenderCommand::run(int &argc, char **argv) const
{
    auto read = job.isEmpty() ? Expected<JsonSource>(JsonSource::fromObject(shortJob(*this))) : JsonSource::read(job);
    if (const InputError *error = errorOf(read)) {
        printError(error->message());
        return exitInput;
    }
    auto &source = std::get<JsonSource>(read);
    if (const auto wrong = applySets(source, sets)) {
        return usage(*wrong);
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

    // What Qt has to say about its surroundings (no session, no screen) is nothing to a person who renders a report.
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &text) {
        if (type == QtCriticalMsg || type == QtFatalMsg) {
            printError(QStringLiteral("kareport: ") + text);
        }
    });
    // Fonts need an application with a platform, but no screen. Most jobs need neither.
    std::unique_ptr<QCoreApplication> application;
    if (JobRunner::needsFonts(readyJob)) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
        application = std::make_unique<QGuiApplication>(argc, argv);
    } else {
        application = std::make_unique<QCoreApplication>(argc, argv);
    }
    catchInterrupts();
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
    return writeOutputs(runner.report(), readyJob, bar, quiet);
}

} // namespace kareport
