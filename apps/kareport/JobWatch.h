#pragma once

#include "CommandLineJob.h"
#include "Commands.h"
#include "FileWatch.h"

#include <QStringList>

namespace kareport
{

/// Makes the reports of a job, and makes them again whenever one of the files that it is made of has changed.
class JobWatch
{
public:
    /// @param command  has one job; it must outlive this
    explicit JobWatch(const RenderCommand &command);

    /// Works until a signal asks the program to end. @return `exitInterrupted`, or what is wrong with the command line or
    /// the surroundings, in which case nothing is watched
    ExitStatus run();

private:
    ExitStatus make();
    ExitStatus makeOnce();
    void watchFiles();
    void makeSoon();
    void sayRun(const CommandLineJob &job, qint64 milliseconds) const;
    void sayWatched() const;

    const RenderCommand &command_;
    FileWatch watch_;
    QStringList files_; ///< that the job is made of, as far as it could be read
    bool isDue_ = false;
};

} // namespace kareport
