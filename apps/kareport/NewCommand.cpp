#include "Commands.h"

#include "OutputFolders.h"
#include "StarterFiles.h"
#include "Xlate.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>

namespace kareport
{

namespace
{

ExitStatus fail(const QString &text)
{
    printError(QStringLiteral("kareport: ") + text);
    return exitOutput;
}

/// A word as a shell takes it.
QString shellWord(QString word)
{
    const bool isPlain = std::all_of(word.begin(), word.end(), [](QChar character) {
        return character.isLetterOrNumber() || QStringView(u"/._+-,:@%").contains(character);
    });
    return isPlain ? word : u'\'' + word.replace(u'\'', QStringLiteral("'\\''")) + u'\'';
}

bool isThere(const QString &path)
{
    const QFileInfo info(path);
    return info.exists() || info.isSymLink();
}

/// Writes a file that is not there. @return what went wrong; nothing when it was written
std::optional<QString> writeNew(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    // A file that came meanwhile is not replaced either.
    if (!file.open(QIODevice::WriteOnly | QIODevice::NewOnly)) {
        return file.errorString();
    }
    if (file.write(bytes) == bytes.size() && file.flush()) {
        return std::nullopt;
    }
    const QString reason = file.errorString();
    file.remove();
    return reason;
}

/// Writes all files or none.
std::optional<QString> writeAll(const QDir &folder, const std::vector<StarterFile> &files)
{
    QStringList written;
    for (const StarterFile &file : files) {
        const QString path = folder.filePath(file.name);
        if (const auto reason = writeNew(path, file.bytes)) {
            for (const QString &earlier : written) {
                QFile::remove(earlier);
            }
            return Xlate("\"%1\" could not be written: %2").arg(QDir::cleanPath(path), *reason);
        }
        written.append(path);
    }
    return std::nullopt;
}

} // namespace

ExitStatus NewCommand::run() const
{
    const QString name = QFileInfo(QDir::cleanPath(QFileInfo(folder).absoluteFilePath())).fileName();
    const QString fileName = name.isEmpty() ? QStringLiteral("report") : name; // the root of all folders has no name
    const QDir dir(folder);
    const auto files = starterFiles(fileName, fileName);
    for (const StarterFile &file : files) {
        const QString path = QDir::cleanPath(dir.filePath(file.name));
        if (isThere(path)) {
            return fail(Xlate("\"%1\" already exists; nothing was written").arg(path));
        }
    }
    const bool isMade = !isThere(folder);
    // The folder itself is what was asked for; those that it is in are not.
    if (const QString missing = missingFolder(QDir::cleanPath(folder)); !missing.isEmpty() && !parents) {
        return fail(Xlate("\"%1\" could not be created: %2").arg(folder, noFolderText(missing)));
    }
    if (const auto reason = QFileInfo(folder).isDir() ? std::nullopt : makeFolders(folder)) {
        return fail(Xlate("\"%1\" could not be created: %2").arg(folder, *reason));
    }
    if (const auto wrong = writeAll(dir, files)) {
        if (isMade) {
            QDir().rmdir(folder);
        }
        return fail(*wrong);
    }
    if (!quiet) {
        const auto pathOf = [&](std::size_t file) { return QDir::cleanPath(dir.filePath(files[file].name)); };
        printLine(Xlate("Created %1 (template), %2 (data), %3 (job)").arg(pathOf(0), pathOf(1), pathOf(2)));
        printLine(Xlate("Next: %1").arg(QStringLiteral("kareport render ") + shellWord(pathOf(2))));
    }
    return exitDone;
}

} // namespace kareport
