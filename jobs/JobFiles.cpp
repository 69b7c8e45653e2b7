#include "JobFiles.h"

#include "DataKind.h"
#include "FileIdentity.h"
#include "Xlate.h"

#include <QDateTime>
#include <QFileInfo>
#include <QHash>

#include <algorithm>

namespace kareport
{

namespace
{

/// What is wrong with an output in the place of a file.
using ClashText = QString (*)(const QString &file);

/// The files that a job is made of, with what is wrong with an output in their place.
QHash<QString, ClashText> sourcesOf(const Job &job, const QString &path)
{
    QHash<QString, ClashText> sources;
    for (const Job::DataSet &set : job.data) {
        for (const QString &file : set.source->files()) {
            sources.insert(fileIdentity(file), clashWithData);
        }
    }
    if (job.reportTemplate) {
        sources.insert(fileIdentity(job.reportTemplate->file), clashWithTemplate);
    }
    if (!path.isEmpty()) {
        sources.insert(fileIdentity(path), clashWithJob);
    }
    return sources;
}

/// The files that a job is made of, with those of its data that `dataFiles` names.
QStringList filesOf(const Job &job, const QString &path, QStringList (DataSource::*dataFiles)() const)
{
    QStringList files;
    if (!path.isEmpty()) {
        files.append(QFileInfo(path).absoluteFilePath());
    }
    if (job.reportTemplate) {
        files.append(job.reportTemplate->file);
    }
    for (const Job::DataSet &set : job.data) {
        files += (set.source.get()->*dataFiles)();
    }
    return files;
}

} // namespace

QString clashWithJob(const QString &file)
{
    return Xlate("\"%1\" is the job itself: another file was expected").arg(file);
}

QString clashWithTemplate(const QString &file)
{
    return Xlate("\"%1\" is the template of the job: another file was expected").arg(file);
}

QString clashWithData(const QString &file)
{
    return Xlate("\"%1\" is data of the job: another file was expected").arg(file);
}

QString clashWithOutput(const QString &file, const QString &other)
{
    return Xlate("\"%1\" is the file of the output \"%2\" already: another file was expected").arg(file, other);
}

QString outputIdentity(const Output &output)
{
    return output.isStandardOutput() ? standardOutputIdentity() : fileIdentity(output.file);
}

std::optional<OutputClash> outputClash(const Job &job, const QString &path)
{
    return outputClash(job, job.outputs, path);
}

std::optional<OutputClash> outputClash(const Job &job, const std::vector<Output> &outputs, const QString &path)
{
    const QHash<QString, ClashText> sources = sourcesOf(job, path);
    QHash<QString, const Output *> earlier;
    for (qsizetype i = 0; i < qsizetype(outputs.size()); ++i) {
        const Output &output = outputs[static_cast<std::size_t>(i)];
        const auto number = static_cast<qsizetype>(output.sideOf.value_or(static_cast<std::size_t>(i)));
        const QString identity = outputIdentity(output);
        if (identity.isEmpty()) {
            continue;
        }
        if (const auto source = sources.constFind(identity); source != sources.constEnd()) {
            return OutputClash{number, source.value()(output.file)};
        }
        const Output *other = earlier.value(identity);
        // Both reports are written to standard output, one after the other.
        if (other != nullptr && !(other->isStandardOutput() && output.isStandardOutput())) {
            return OutputClash{number, clashWithOutput(output.file, other->file)};
        }
        earlier.insert(identity, &output);
    }
    return std::nullopt;
}

QStringList watchedFiles(const Job &job, const QString &path)
{
    return filesOf(job, path, &DataSource::possibleFiles);
}

bool isUpToDate(const Job &job, const QString &path)
{
    if (!std::all_of(job.data.begin(), job.data.end(),
                     [](const Job::DataSet &set) { return set.source->isAllInFiles(); })) {
        return false;
    }
    const QStringList sources = filesOf(job, path, &DataSource::files);
    return !job.outputs.empty() && std::all_of(job.outputs.begin(), job.outputs.end(), [&](const Output &output) {
        const QFileInfo written(output.file);
        return !output.isStandardOutput() && written.isFile() &&
               std::all_of(sources.begin(), sources.end(), [&](const QString &source) {
                   const QFileInfo info(source);
                   // What is missing shows as an error when the job runs.
                   return info.exists() && info.lastModified() < written.lastModified();
               });
    });
}

} // namespace kareport
