#include "ShippedExamples.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStandardPaths>

#include <algorithm>

namespace kareport
{

namespace
{

QString &givenFolder()
{
    static QString folder;
    return folder;
}

/// A folder of that name may be anything: ours has the template that most of the jobs use.
bool holdsExamples(const QString &folder)
{
    return QFileInfo(folder + QStringLiteral("/survey.xml")).isFile() &&
           QFileInfo(folder + QStringLiteral("/stakeout.json")).isFile();
}

} // namespace

QString examplesFolder()
{
    if (!givenFolder().isEmpty()) {
        return givenFolder();
    }
    const QDir programs(QCoreApplication::applicationDirPath());
    // Installed, in the folder of a build, and one deeper, where tests are.
    for (const char *place : {"../share/kareport/examples", "../../../examples", "../../../../examples"}) {
        const QString folder = QDir::cleanPath(programs.filePath(QString::fromLatin1(place)));
        if (holdsExamples(folder)) {
            return folder;
        }
    }
    return QStandardPaths::locate(QStandardPaths::GenericDataLocation, QStringLiteral("kareport/examples"),
                                  QStandardPaths::LocateDirectory);
}

void setExamplesFolder(const QString &path)
{
    givenFolder() = path;
}

std::vector<ShippedExample> shippedExamples(const QString &folder)
{
    std::vector<ShippedExample> examples;
    if (folder.isEmpty()) {
        return examples;
    }
    QStringList patterns;
    patterns.append(QStringLiteral("*.json"));
    for (const QFileInfo &info : QDir(folder).entryInfoList(patterns, QDir::Files, QDir::Name)) {
        QFile file(info.filePath());
        const QJsonDocument job =
            file.open(QIODevice::ReadOnly) ? QJsonDocument::fromJson(file.readAll()) : QJsonDocument();
        if (job.isObject()) {
            const QString title = job.object().value(u"title").toString();
            examples.push_back({info.filePath(), title.isEmpty() ? info.completeBaseName() : title});
        }
    }
    std::stable_sort(examples.begin(), examples.end(), [](const ShippedExample &one, const ShippedExample &other) {
        return one.title.compare(other.title, Qt::CaseInsensitive) < 0;
    });
    return examples;
}

bool isShippedExample(const QString &path)
{
    const QString folder = examplesFolder();
    return !folder.isEmpty() && QFileInfo(path).canonicalFilePath().startsWith(QDir(folder).canonicalPath() + u'/');
}

} // namespace kareport
