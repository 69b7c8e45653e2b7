#include "Commands.h"

#include "CheckOutput.h"
#include "CommandSetup.h"
#include "FileIdentity.h"
#include "FileKind.h"
#include "Interrupt.h"
#include "JobCheck.h"
#include "JobFiles.h"
#include "NotesFile.h"
#include "StandardText.h"
#include "TerminalProgress.h"
#include "Xlate.h"

#include <QHash>
#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>
#include <iterator>
#include <new>

namespace kareport
{

namespace
{

CheckedFile noMemoryFor(const QString &file)
{
    CheckedFile checked;
    checked.file = file;
    checked.add(true, {file, std::nullopt, noMemoryText()});
    return checked;
}

/// The file for the notes on a job; empty where none is written.
QString notesFileOf(const CheckCommand &command, const QString &job)
{
    return namedAfterJob(command.notes.value_or(QString()), job);
}

/// The job files among those that are checked. Some are opened to find out.
QStringList jobsOf(const CheckCommand &command)
{
    QStringList jobs;
    std::copy_if(command.files.begin(), command.files.end(), std::back_inserter(jobs), isJobFile);
    return jobs;
}

/// What of the files that are checked the notes would replace, or which notes others.
std::optional<QString> notesClash(const CheckCommand &command, const QStringList &jobs)
{
    QHash<QString, QString (*)(const QString &)> taken;
    for (const QString &file : command.files) {
        if (file != u"-") {
            taken.insert(fileIdentity(file), jobs.contains(file) ? clashWithJob : clashWithTemplate);
        }
    }
    for (const QString &job : jobs) {
        const QString notes = notesFileOf(command, job);
        const QString identity = notes.isEmpty() ? QString() : fileIdentity(notes);
        if (identity.isEmpty()) {
            continue;
        }
        if (const auto clash = taken.constFind(identity); clash != taken.constEnd()) {
            return clash.value()(notes);
        }
        taken.insert(identity, [](const QString &file) { return clashWithOutput(file, file); });
    }
    return std::nullopt;
}

/// @param wrongSet  receives what is wrong with a key that the command line sets; the job is not checked then
CheckedFile checkFile(const CheckCommand &command, const QString &file, bool isJob, Progress &progress,
                      std::optional<QString> &wrongSet)
{
    try {
        if (!isJob) {
            return checkTemplateFile(file);
        }
        auto source = JsonSource::read(file);
        if (auto *json = std::get_if<JsonSource>(&source)) {
            wrongSet = applySets(*json, command.sets);
        }
        return wrongSet ? CheckedFile() : checkJob(file, source, command.strict, notesFileOf(command, file), progress);
    } catch (const std::bad_alloc &) {
        return noMemoryFor(file);
    }
}

void printJson(const QJsonArray &list)
{
    const QString text = QString::fromUtf8(QJsonDocument(list).toJson(QJsonDocument::Indented)).trimmed();
    for (const QString &line : text.split(u'\n')) {
        printLine(line);
    }
}

} // namespace

std::optional<QString> CheckCommand::usageError() const
{
    if (files.count(QStringLiteral("-")) > 1) {
        return Xlate("standard input is one job: - was expected once");
    }
    return notes ? wrongNotesFile(notes, jobsOf(*this).size() > 1) : std::nullopt;
}

ExitStatus CheckCommand::run(int &argc, char **argv) const
{
    const QStringList jobs = jobsOf(*this);
    if (const auto clash = notesClash(*this, jobs)) {
        printError(QStringLiteral("kareport: ") + *clash);
        return exitInput;
    }
    // A job's page may be measured, which takes fonts.
    const auto application = !jobs.isEmpty() ? startQt(argc, argv, true) : nullptr;
    TerminalProgress bar(progress);
    ExitStatus status = exitDone;
    QJsonArray all;
    for (qsizetype i = 0; i < files.size(); ++i) {
        const QString &file = files[i];
        bar.beginShare(static_cast<std::size_t>(i), static_cast<std::size_t>(files.size()));
        std::optional<QString> wrongSet;
        const CheckedFile checked = checkFile(*this, file, jobs.contains(file), bar, wrongSet);
        if (wrongSet) {
            return usageExit(*wrongSet);
        }
        if (checked.isStopped || isInterrupted()) {
            printError(Xlate("kareport: stopped; nothing more was checked"));
            return exitInterrupted;
        }
        if (json) {
            all.append(checkedToJson(checked));
        } else {
            printChecked(checked, quiet);
        }
        status = std::max(status, checked.hasErrors() ? exitInput : exitDone);
        const bool isNoted = notes && checked.isJob && !checked.isNotesFileNeeded;
        if (isNoted && !writeNotesFile(checked.notes, notesFileOf(*this, file), OutputFolders(parents))) {
            status = std::max(status, exitOutput);
        }
    }
    bar.complete();
    if (json) {
        printJson(all);
    }
    return status;
}

} // namespace kareport
