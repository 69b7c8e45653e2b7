#include "JobWatch.h"

#include "DataKind.h"
#include "Interrupt.h"
#include "JobFiles.h"
#include "Progress.h"
#include "Signals.h"
#include "StandardText.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <QTime>
#include <QTimer>

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

/// A file as a person in the current folder names it.
QString shortName(const QString &file)
{
    const QString relative = QDir::current().relativeFilePath(file);
    return relative.startsWith(u"../") ? file : relative;
}

QString namesOf(const QStringList &files)
{
    QStringList names;
    for (const QString &file : files) {
        names.append(shortName(file));
    }
    return names.join(QStringLiteral(", "));
}

QString namesOf(const std::vector<Output> &outputs)
{
    QStringList names;
    for (const Output &output : outputs) {
        names.append(output.isStandardOutput() ? Xlate("standard output") : shortName(output.file));
    }
    return names.join(QStringLiteral(", "));
}

QString notesText(qsizetype count)
{
    if (count == 0) {
        return {};
    }
    return QStringLiteral(", ") + (count == 1 ? Xlate("1 note") : Xlate("%1 notes").arg(count));
}

QString now()
{
    return QTime::currentTime().toString(QStringLiteral("HH:mm:ss"));
}

bool readsStandardInput(const Job &job)
{
    return std::any_of(job.data.begin(), job.data.end(),
                       [](const Job::DataSet &set) { return set.source->readsStandardInput(); });
}

} // namespace

JobWatch::JobWatch(const RenderCommand &command)
    : command_(command),
      watch_([this](const QString & /*path*/) { makeSoon(); }),
      files_(QFileInfo(command.jobs.first()).absoluteFilePath())
{}

ExitStatus JobWatch::run()
{
    const ExitStatus first = make();
    if (first == exitInterrupted || first == exitUsage) {
        return first;
    }
    if (!callOnInterrupt(QCoreApplication::instance(), [] { QCoreApplication::exit(0); })) {
        printError(Xlate("kareport: the system has no more descriptors"));
        return exitOutput;
    }
    sayWatched();
    QCoreApplication::exec();
    return exitInterrupted;
}

/// Several files may have changed at once.
void JobWatch::makeSoon()
{
    if (!isDue_) {
        isDue_ = true;
        QTimer::singleShot(0, QCoreApplication::instance(), [this] {
            isDue_ = false;
            if (make() == exitInterrupted) {
                QCoreApplication::exit(0);
            }
        });
    }
}

ExitStatus JobWatch::make()
{
    // How the files are before they are read: a change meanwhile is not missed.
    for (const QString &file : files_) {
        watch_.expect(file);
    }
    ExitStatus status = exitInput;
    try {
        status = makeOnce();
    } catch (const std::bad_alloc &) {
        printError(InputError{command_.jobs.first(), std::nullopt, noMemoryText()}.message());
    }
    watchFiles();
    return status;
}

ExitStatus JobWatch::makeOnce()
{
    QElapsedTimer clock;
    clock.start();
    CommandLineJob job(command_, JsonSource::read(command_.jobs.first()));
    if (job.status() == exitDone && readsStandardInput(job.job())) {
        job.fail(Xlate("standard input can be read only once: a file was expected for each data set"));
    }
    if (job.status() == exitDone) {
        // Of a job that cannot be read, those that were known are watched on.
        const QStringList files = watchedFiles(job.job(), command_.jobs.first());
        for (const QString &file : files) {
            if (!files_.contains(file)) {
                watch_.expect(file);
            }
        }
        files_ = files;
        Progress none(false);
        job.run(none);
    }
    if (job.status() != exitInterrupted && job.status() != exitUsage) {
        sayRun(job, clock.elapsed());
    }
    return job.status();
}

void JobWatch::watchFiles()
{
    watch_.retain(files_);
    for (const QString &file : files_) {
        watch_.watch(file);
    }
}

void JobWatch::sayRun(const CommandLineJob &job, qint64 milliseconds) const
{
    if (command_.quiet) {
        return;
    }
    constexpr double second = 1000;
    switch (job.status()) {
    case exitDone:
        printError(Xlate("kareport: %1: made in %2 s: %3")
                       .arg(now(), QString::number(double(milliseconds) / second, 'f', 2), namesOf(job.job().outputs)) +
                   notesText(job.noteCount()));
        break;
    case exitOutput: printError(Xlate("kareport: %1: not all outputs were written").arg(now())); break;
    default: printError(Xlate("kareport: %1: failed; earlier outputs are unchanged").arg(now())); break;
    }
}

void JobWatch::sayWatched() const
{
    if (!command_.quiet) {
        printError(Xlate("kareport: watching %1; press Ctrl+C to stop").arg(namesOf(files_)));
    }
}

} // namespace kareport
