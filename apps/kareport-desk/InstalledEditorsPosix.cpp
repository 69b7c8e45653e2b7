#include "InstalledEditors.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QLocale>
#include <QProcess>
#include <QSet>
#include <QStandardPaths>

#include <algorithm>
#include <optional>

namespace kareport
{

namespace
{

/// The entries of a description's first group.
QHash<QString, QString> readDescription(const QString &path)
{
    QHash<QString, QString> entries;
    QFile file(path);
    constexpr qint64 longest = qint64(1024) * 1024;
    if (!file.open(QIODevice::ReadOnly) || file.size() > longest) {
        return entries;
    }
    bool isInGroup = false;
    for (const QByteArray &bytes : file.readAll().split('\n')) {
        const QString line = QString::fromUtf8(bytes).trimmed();
        if (line.startsWith(u'[')) {
            isInGroup = line == u"[Desktop Entry]";
        } else if (const qsizetype equals = line.indexOf(u'='); isInGroup && equals > 0 && !line.startsWith(u'#')) {
            entries.insert(line.left(equals).trimmed(), line.mid(equals + 1).trimmed());
        }
    }
    return entries;
}

std::optional<InstalledEditor> editorOf(const QHash<QString, QString> &entries)
{
    const auto isTrue = [&entries](const char *key) { return entries.value(QString::fromLatin1(key)) == u"true"; };
    const QStringList types = entries.value(QStringLiteral("MimeType")).split(u';');
    const bool opensText = types.contains(u"text/plain") || types.contains(u"application/rtf") ||
                           types.contains(u"text/rtf") || types.contains(u"application/x-rtf");
    // A program for the terminal would start without a window.
    if (!opensText || isTrue("NoDisplay") || isTrue("Hidden") || isTrue("Terminal")) {
        return std::nullopt;
    }
    const QString program = QProcess::splitCommand(entries.value(QStringLiteral("Exec"))).value(0);
    const QString path = QStandardPaths::findExecutable(program);
    if (program.isEmpty() || path.isEmpty()) {
        return std::nullopt;
    }
    const QString locale = QLocale().name();
    const QString name = entries.value(QStringLiteral("Name"));
    const QString language = QStringLiteral("Name[%1]").arg(locale.section(u'_', 0, 0));
    return InstalledEditor{entries.value(QStringLiteral("Name[%1]").arg(locale), entries.value(language, name)), path};
}

} // namespace

std::vector<InstalledEditor> installedEditors(const QStringList &folders)
{
    std::vector<InstalledEditor> editors;
    QSet<QString> described; // a file in an earlier folder hides files of that name in later ones
    const QStringList places =
        folders.isEmpty() ? QStandardPaths::standardLocations(QStandardPaths::ApplicationsLocation) : folders;
    for (const QString &folder : places) {
        for (const QFileInfo &file : QDir(folder).entryInfoList({QStringLiteral("*.desktop")}, QDir::Files)) {
            if (described.contains(file.fileName())) {
                continue;
            }
            described.insert(file.fileName());
            if (const auto editor = editorOf(readDescription(file.filePath()))) {
                editors.push_back(*editor);
            }
        }
    }
    std::sort(editors.begin(), editors.end(), [](const InstalledEditor &a, const InstalledEditor &b) {
        return QString::localeAwareCompare(a.name, b.name) < 0;
    });
    return editors;
}

QString programsFolder()
{
    return QStringLiteral("/usr/bin");
}

} // namespace kareport
