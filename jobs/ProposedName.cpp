#include "ProposedName.h"

#include "FileKind.h"
#include "ShippedExamples.h"

#include <QDir>
#include <QFileInfo>
#include <QStandardPaths>

namespace kareport
{

namespace
{

constexpr qsizetype mostCharacters = 100; ///< of a name: a file system takes 255 bytes

QString folderFor(const NamedReport &report)
{
    if (!report.file.isEmpty()) {
        return QFileInfo(report.file).absolutePath();
    }
    const QFileInfo beside(QFileInfo(report.origin).absolutePath());
    if (!report.origin.isEmpty() && !isShippedExample(report.origin) && beside.isDir() && beside.isWritable()) {
        return beside.filePath();
    }
    if (!report.folder.isEmpty()) {
        return report.folder;
    }
    const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    return QFileInfo(documents).isDir() ? documents : QDir::homePath();
}

} // namespace

QString fileNameOf(const QString &text)
{
    QString name;
    for (const QChar character : text.left(mostCharacters)) {
        const bool isSpecial = !character.isPrint() || QStringView(u"/\\:*?\"<>|").contains(character);
        name += isSpecial ? u'-' : character;
    }
    name = name.simplified();
    while (name.startsWith(u'.') || name.startsWith(u'-') || name.startsWith(u' ')) {
        name.remove(0, 1); // hidden files, and what programs take for options
    }
    return name;
}

QString proposedName(const NamedReport &report, const QString &ending)
{
    QString name = report.file.isEmpty() ? fileNameOf(report.title) : QFileInfo(report.file).completeBaseName();
    if (name.isEmpty()) {
        name = QFileInfo(report.origin).completeBaseName();
    }
    return name.isEmpty() ? QString() : QDir(folderFor(report)).filePath(name + u'.' + ending);
}

QString withOtherEnding(const QString &name, const QString &pattern, const QStringList &patterns)
{
    if (!pattern.startsWith(u"*.")) {
        return name;
    }
    for (const QString &known : patterns) {
        if (known.startsWith(u"*.") && hasEnding(name, QStringView(known).sliced(1))) {
            return name.chopped(known.size() - 1) + pattern.sliced(1);
        }
    }
    return name;
}

} // namespace kareport
