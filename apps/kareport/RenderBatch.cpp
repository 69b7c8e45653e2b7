#include "RenderBatch.h"

#include "FileIdentity.h"
#include "Interrupt.h"
#include "JobFiles.h"
#include "StandardText.h"
#include "Xlate.h"

#include <algorithm>
#include <new>

namespace kareport
{

void RenderBatch::keep(const QStringList &jobs, const QString &jobList)
{
    for (const QString &job : jobs) {
        kept_.insert(fileIdentity(job), job);
    }
    if (!jobList.isEmpty() && jobList != u"-") {
        kept_.insert(fileIdentity(jobList), jobList);
    }
    kept_.remove(QString()); // pipes
}

ExitStatus RenderBatch::run(const QStringList &jobs)
{
    ExitStatus worst = exitDone;
    for (qsizetype i = 0; i < jobs.size(); ++i) {
        if (isInterrupted()) {
            worst = exitInterrupted;
            break;
        }
        progress_.setPrefix(QStringLiteral("%1/%2 ").arg(i + 1).arg(jobs.size()));
        progress_.beginShare(static_cast<std::size_t>(i), static_cast<std::size_t>(jobs.size()));
        progress_.begin(jobs[i], 0);
        ExitStatus status = exitInput;
        try {
            status = make(jobs[i]);
        } catch (const std::bad_alloc &) {
            printError(InputError{jobs[i], std::nullopt, noMemoryText()}.message());
        }
        failed_ += status == exitDone || status == exitInterrupted ? 0 : 1;
        worst = std::max(worst, status);
    }
    // The work is at its end also when some of the jobs have failed.
    if (worst != exitInterrupted) {
        progress_.complete();
    }
    eraseProgress();
    if (!command_.quiet || worst == exitInterrupted) {
        sayWhatWasDone(jobs.size());
    }
    return worst;
}

ExitStatus RenderBatch::make(const QString &path)
{
    CommandLineJob job(command_, JsonSource::read(path));
    if (job.status() != exitDone || takesFileOfAnother(job, path)) {
        return job.status();
    }
    if (command_.onlyOutdated && isUpToDate(job.job(), path)) {
        noteFiles(job.job(), path);
        ++upToDate_;
        return exitDone;
    }
    const ExitStatus status = job.run(progress_);
    if (status == exitDone) {
        noteFiles(job.job(), path);
        ++made_;
    }
    return status;
}

/// Whether a file that a job writes was written by an earlier one, or is needed by another: one of the two would be lost.
bool RenderBatch::takesFileOfAnother(CommandLineJob &job, const QString &path)
{
    for (const Output &output : job.job().outputs) {
        const QString identity = outputIdentity(output);
        if (const auto file = kept_.constFind(identity); file != kept_.constEnd() && *file != path) {
            job.fail(
                Xlate("\"%1\" is the file \"%2\" of this batch: another file was expected").arg(output.file, *file));
            return true;
        }
        if (const auto writer = writers_.constFind(identity); writer != writers_.constEnd()) {
            job.fail(Xlate("\"%1\" is written by the job \"%2\" already: another file was expected")
                         .arg(output.file, *writer));
            return true;
        }
    }
    return false;
}

void RenderBatch::noteFiles(const Job &job, const QString &path)
{
    for (const Output &output : job.outputs) {
        const QString identity = output.isStandardOutput() ? QString() : outputIdentity(output);
        if (!identity.isEmpty()) {
            writers_.insert(identity, path);
        }
    }
}

void RenderBatch::sayWhatWasDone(qsizetype jobs) const
{
    if (jobs == 0) {
        printError(Xlate("kareport: there was no job to run"));
        return;
    }
    QStringList parts = {Xlate("%1 of %2 jobs made").arg(made_).arg(jobs)};
    if (upToDate_ > 0) {
        parts.append(Xlate("%1 up to date").arg(upToDate_));
    }
    if (failed_ > 0) {
        parts.append(Xlate("%1 failed").arg(failed_));
    }
    if (const qsizetype left = jobs - made_ - upToDate_ - failed_; left > 0) {
        parts.append(Xlate("%1 not made when stopped").arg(left));
    }
    printError(QStringLiteral("kareport: ") + parts.join(QStringLiteral(", ")));
}

} // namespace kareport
