#include "RenderBatch.h"

#include "Interrupt.h"
#include "UpToDate.h"
#include "Xlate.h"

#include <QFileInfo>

#include <algorithm>
#include <new>

namespace kareport
{

ExitStatus RenderBatch::run(const QStringList &jobs)
{
    ExitStatus worst = exitDone;
    for (qsizetype i = 0; i < jobs.size() && worst != exitInterrupted; ++i) {
        progress_.setPrefix(QStringLiteral("%1/%2 ").arg(i + 1).arg(jobs.size()));
        progress_.begin(jobs[i], 0);
        ExitStatus status = exitInput;
        try {
            status = make(jobs[i]);
        } catch (const std::bad_alloc &) {
            progress_.finish();
            printError(InputError{jobs[i], std::nullopt, Xlate("there is not enough memory for this job")}.message());
        }
        failed_ += status == exitDone || status == exitInterrupted ? 0 : 1;
        worst = isInterrupted() ? exitInterrupted : std::max(worst, status);
    }
    progress_.finish();
    if (!command_.quiet || worst == exitInterrupted) {
        sayWhatWasDone(jobs.size());
    }
    return worst;
}

ExitStatus RenderBatch::make(const QString &path)
{
    RenderJob job(command_, JsonSource::read(path));
    if (job.status() != exitDone || takesFileOfAnother(job, path)) {
        return job.status();
    }
    if (command_.onlyOutdated && isUpToDate(job.job(), path)) {
        ++upToDate_;
        return exitDone;
    }
    const ExitStatus status = job.run(progress_);
    made_ += status == exitDone ? 1 : 0;
    return status;
}

/// Whether an earlier job writes a file that this one writes too: one of the two reports would be lost.
bool RenderBatch::takesFileOfAnother(RenderJob &job, const QString &path)
{
    for (const Output &output : job.job().outputs) {
        if (output.isStandardOutput()) {
            continue;
        }
        const QString file = QFileInfo(output.file).absoluteFilePath();
        if (const auto writer = writers_.constFind(file); writer != writers_.constEnd()) {
            job.fail(Xlate("\"%1\" is written by the job \"%2\" already: an output of its own was expected")
                         .arg(output.file, *writer));
            return true;
        }
    }
    for (const Output &output : job.job().outputs) {
        if (!output.isStandardOutput()) {
            writers_.insert(QFileInfo(output.file).absoluteFilePath(), path);
        }
    }
    return false;
}

void RenderBatch::sayWhatWasDone(qsizetype jobs) const
{
    if (jobs == 0) {
        printError(Xlate("kareport: there was no job to make"));
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
