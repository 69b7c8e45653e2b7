#include "TemplateData.h"

#include "FileKind.h"
#include "Job.h"
#include "Profile.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>

namespace kareport
{

namespace
{

const QString dataEntry = QStringLiteral("Template Data ");

QString entryOf(const QString &templateFile)
{
    return dataEntry + QFileInfo(templateFile).absoluteFilePath();
}

/// The template file that a job names; empty for what is not a job.
QString templateOf(const QFileInfo &job)
{
    QFile file(job.filePath());
    if (!file.open(QIODevice::ReadOnly)) {
        return QString();
    }
    const QJsonObject content = QJsonDocument::fromJson(file.readAll()).object();
    const QString name = content[u"template"][u"file"].toString();
    return name.isEmpty() ? QString() : job.dir().filePath(name);
}

} // namespace

Expected<JsonSource> TemplateData::source(const QString &templateFile) const
{
    if (isJobFile(file)) {
        return JsonSource::read(file);
    }
    TemplateJob job;
    job.templateFile = QFileInfo(templateFile).absoluteFilePath();
    job.templateName = templateName;
    job.table = table;
    job.block = block;
    job.data = QFileInfo(file).absoluteFilePath();
    return JsonSource::fromObject(job.toJson());
}

QStringList jobsOfTemplate(const QString &templateFile)
{
    constexpr qsizetype mostFiles = 200;
    constexpr qint64 largestJob = 1 << 20;
    const QString wanted = QFileInfo(templateFile).canonicalFilePath();
    QStringList jobs;
    const QFileInfoList files =
        QFileInfo(templateFile).absoluteDir().entryInfoList({QStringLiteral("*.json")}, QDir::Files, QDir::Name);
    for (const QFileInfo &file : files.mid(0, mostFiles)) {
        if (file.size() <= largestJob && QFileInfo(templateOf(file)).canonicalFilePath() == wanted) {
            jobs.append(file.absoluteFilePath());
        }
    }
    return jobs;
}

TemplateData rememberedData(const QString &templateFile)
{
    const QJsonArray kept =
        QJsonDocument::fromJson(GetProfileString(QString(), entryOf(templateFile)).toUtf8()).array();
    const TemplateData data = {kept.at(0).toString(), kept.at(1).toString(), kept.at(2).toString(),
                               kept.at(3).toString()};
    return QFileInfo(data.file).isFile() ? data : TemplateData();
}

void rememberData(const QString &templateFile, const TemplateData &data)
{
    const QJsonArray kept = {data.file, data.templateName, data.table, data.block};
    WriteProfileString(QString(), entryOf(templateFile),
                       QString::fromUtf8(QJsonDocument(kept).toJson(QJsonDocument::Compact)));
}

} // namespace kareport
