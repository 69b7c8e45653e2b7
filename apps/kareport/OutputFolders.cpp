#include "OutputFolders.h"

#include "LinkTarget.h"
#include "SystemPath.h"
#include "Xlate.h"

#include <QFileInfo>

#include <filesystem>
#include <system_error>

namespace kareport
{

namespace
{

constexpr int mostLinks = 40; ///< on the way to one file, as in the system

/// The file that is written for a name: what a link points to, which need not be there. Empty where a link may not be followed.
QString writtenFile(QString file)
{
    if (linkTarget(file).isEmpty()) {
        return {};
    }
    for (int links = 0; links < mostLinks && QFileInfo(file).isSymLink(); ++links) {
        file = QFileInfo(file).symLinkTarget();
    }
    return file;
}

} // namespace

QString missingFolder(const QString &file)
{
    if (file.isEmpty() || file == u"-") {
        return {};
    }
    const QString target = writtenFile(file);
    QString missing = QFileInfo(target).path();
    if (target.isEmpty() || QFileInfo::exists(missing)) {
        return {};
    }
    for (QString above = QFileInfo(missing).path(); above != missing && !QFileInfo::exists(above);
         above = QFileInfo(above).path())
    {
        missing = above;
    }
    return missing;
}

QString noFolderText(const QString &folder)
{
    return Xlate("there is no folder \"%1\"; --parents creates it").arg(folder);
}

std::optional<QString> makeFolders(const QString &folder)
{
    std::error_code error;
    std::filesystem::create_directories(standardPath(folder), error);
    return error ? std::optional(QString::fromLocal8Bit(error.message().c_str())) : std::nullopt;
}

void OutputFolders::prepare(const QString &file) const
{
    if (areMade_ && !missingFolder(file).isEmpty()) {
        makeFolders(QFileInfo(writtenFile(file)).path());
    }
}

std::optional<QString> OutputFolders::whyNotWritten(const QString &file) const
{
    const QString missing = missingFolder(file);
    if (missing.isEmpty()) {
        return std::nullopt;
    }
    if (!areMade_) {
        return noFolderText(missing);
    }
    return Xlate("the folder \"%1\" could not be created: %2").arg(missing, makeFolders(missing).value_or(QString()));
}

} // namespace kareport
