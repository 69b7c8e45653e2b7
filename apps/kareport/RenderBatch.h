#pragma once

#include "CommandLineJob.h"
#include "Commands.h"
#include "TerminalProgress.h"

#include <QHash>

namespace kareport
{

/// Makes the reports of many jobs, one after the other. A job that fails does not keep the others from being made.
class RenderBatch
{
public:
    explicit RenderBatch(const RenderCommand &command) : command_(command), progress_(command.progress) {}

    /// Files that no output of the batch may replace: all its jobs, also those that another process makes, and the list
    /// that names them.
    void keep(const QStringList &jobs, const QString &jobList);
    /// @return the greatest status of all jobs
    ExitStatus run(const QStringList &jobs);

private:
    ExitStatus make(const QString &path);
    bool takesFileOfAnother(CommandLineJob &job, const QString &path);
    void noteFiles(const Job &job, const QString &path);
    void sayWhatWasDone(qsizetype jobs) const;

    const RenderCommand &command_;
    TerminalProgress progress_;
    QHash<QString, QString> writers_; ///< identities of files that were written, jobs that wrote them
    QHash<QString, QString> kept_;    ///< identities and names of the batch's own files
    qsizetype made_ = 0;
    qsizetype upToDate_ = 0;
    qsizetype failed_ = 0;
};

} // namespace kareport
