#include "NotesFile.h"

#include "Printing.h"
#include "ReplaceFile.h"
#include "Xlate.h"

#include <QFileInfo>
#include <QIODevice>

namespace kareport
{

std::optional<QString> wrongNotesFile(const std::optional<QString> &file, bool areSeveral)
{
    if (file && (file->isEmpty() || *file == u"-")) {
        return Xlate("--notes \"%1\": the name of a file was expected").arg(*file);
    }
    if (file && areSeveral && !file->contains(QStringLiteral("{}"))) {
        return Xlate("--notes \"%1\" is one file for several jobs: a name with {} was expected, which is replaced by "
                     "the name of the job file")
            .arg(*file);
    }
    return std::nullopt;
}

QString namedAfterJob(QString name, const QString &jobFile)
{
    return jobFile.isEmpty() ? name : name.replace(QStringLiteral("{}"), QFileInfo(jobFile).completeBaseName());
}

bool writeNotesFile(const JobNotes &notes, const QString &file, const OutputFolders &folders)
{
    folders.prepare(file);
    const QByteArray json = notes.toJson();
    QString problem;
    const bool isWritten = replaceFile(
        file, [&json](QIODevice &device) { return device.write(json) == json.size(); }, &problem);
    if (!isWritten) {
        printError(Xlate("kareport: \"%1\" could not be written: %2")
                       .arg(file, folders.whyNotWritten(file).value_or(problem)));
    }
    return isWritten;
}

} // namespace kareport
