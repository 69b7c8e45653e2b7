#include "Commands.h"

#include "CheckOutput.h"
#include "CommandSetup.h"
#include "FileIdentity.h"
#include "Interrupt.h"
#include "JobCheck.h"
#include "ReplaceFile.h"
#include "TerminalProgress.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

/// Whether a file is a job. A name that does not tell is looked into: a job begins with a brace.
bool isJobFile(const QString &file)
{
    if (file == u"-" || file.endsWith(u".json", Qt::CaseInsensitive)) {
        return true;
    }
    QFile opened(file);
    if (file.endsWith(u".xml", Qt::CaseInsensitive) || !QFileInfo(file).isFile() || !opened.open(QIODevice::ReadOnly)) {
        return false;
    }
    constexpr qint64 lookedAt = 4096;
    const QByteArray begin = opened.read(lookedAt).trimmed();
    return begin.startsWith('{');
}

CheckedFile noMemoryFor(const QString &file)
{
    CheckedFile checked;
    checked.file = file;
    checked.add(true, {file, std::nullopt, Xlate("there is not enough memory for this file")});
    return checked;
}

/// The file for the notes on a job; empty where none is written.
QString notesFileOf(const CheckCommand &command, const QString &job)
{
    return command.notes.value_or(QString()).replace(QStringLiteral("{}"), QFileInfo(job).completeBaseName());
}

/// What of the files that are checked the notes would replace, or which notes others.
std::optional<QString> notesClash(const CheckCommand &command)
{
    QHash<QString, QString> taken;
    for (const QString &file : command.files) {
        if (file != u"-") {
            taken.insert(fileIdentity(file),
                         isJobFile(file)
                             ? Xlate("\"%1\" is the job itself: an output of its own was expected")
                             : Xlate("\"%1\" is the template of the job: an output of its own was expected"));
        }
    }
    for (const QString &file : command.files) {
        const QString notes = isJobFile(file) ? notesFileOf(command, file) : QString();
        const QString identity = notes.isEmpty() ? QString() : fileIdentity(notes);
        if (identity.isEmpty()) {
            continue;
        }
        if (const auto clash = taken.constFind(identity); clash != taken.constEnd()) {
            return clash->arg(notes, notes);
        }
        taken.insert(identity,
                     Xlate("\"%1\" is the file of the output \"%2\" already: an output of its own was expected"));
    }
    return std::nullopt;
}

CheckedFile checkFile(const CheckCommand &command, const QString &file, Progress &progress)
{
    try {
        return isJobFile(file) ? checkJob(file, JsonSource::read(file), command.sets, command.strict,
                                          notesFileOf(command, file), progress)
                               : checkTemplateFile(file);
    } catch (const std::bad_alloc &) {
        return noMemoryFor(file);
    }
}

/// @return whether the file with the notes on a job was written
bool writeNotes(const CheckedFile &checked, const QString &file)
{
    const QByteArray json = checked.notes.toJson();
    QString problem;
    const bool isWritten = replaceFile(
        file, [&json](QIODevice &device) { return device.write(json) == json.size(); }, &problem);
    if (!isWritten) {
        printError(Xlate("kareport: \"%1\" could not be written: %2").arg(file, problem));
    }
    return isWritten;
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
    if (notes && (notes->isEmpty() || *notes == u"-")) {
        return Xlate("--notes \"%1\": the name of a file was expected").arg(*notes);
    }
    const auto jobs = std::count_if(files.begin(), files.end(), isJobFile);
    if (notes && jobs > 1 && !notes->contains(QStringLiteral("{}"))) {
        return Xlate("--notes \"%1\" is one file for several jobs: a name with {} was expected, which stands for the "
                     "name of the job file")
            .arg(*notes);
    }
    return std::nullopt;
}

ExitStatus CheckCommand::run(int &argc, char **argv) const
{
    if (const auto clash = notesClash(*this)) {
        printError(QStringLiteral("kareport: ") + *clash);
        return exitInput;
    }
    // A job's page may be measured, which takes fonts.
    const bool hasJobs = std::any_of(files.begin(), files.end(), isJobFile);
    const auto application = hasJobs ? startQt(argc, argv, true) : nullptr;
    TerminalProgress bar(progress);
    ExitStatus status = exitDone;
    QJsonArray all;
    for (const QString &file : files) {
        const CheckedFile checked = checkFile(*this, file, bar);
        if (checked.wrongSet) {
            return usageExit(*checked.wrongSet);
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
        if (isNoted && !writeNotes(checked, notesFileOf(*this, file))) {
            status = std::max(status, exitOutput);
        }
    }
    if (json) {
        printJson(all);
    }
    return status;
}

} // namespace kareport
