#include "UpToDate.h"

#include "TemplateSource.h"

#include <QDateTime>
#include <QFileInfo>

#include <algorithm>

namespace kareport
{

bool isUpToDate(const Job &job, const QString &path)
{
    QStringList sources;
    if (!path.isEmpty()) {
        sources.append(path);
    }
    if (job.reportTemplate) {
        sources.append(templatePath(job));
    }
    for (const Job::DataSet &set : job.data) {
        if (!set.csv.isEmpty()) {
            sources.append(set.csv);
        }
    }
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
