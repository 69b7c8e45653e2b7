#pragma once

#include "Job.h"

#include <QString>
#include <QStringList>

#include <optional>

namespace kareport
{

/// An output that would take the place of something that is needed.
struct OutputClash
{
    qsizetype output; ///< its number among the job's outputs
    QString text;     ///< a sentence that says what was expected
};

///@{
/// What is wrong with writing to a file that is needed for something else, as a sentence that says what was expected.
QString clashWithJob(const QString &file);
QString clashWithTemplate(const QString &file);
QString clashWithData(const QString &file);
QString clashWithOutput(const QString &file, const QString &other);
///@}

/// The file that an output becomes, as `fileIdentity` tells it.
QString outputIdentity(const Output &output);

/// The first output of a job that is the job file, its template or its data, or that another output is already.
/// @param path  the job file; empty for a job that is in no file
std::optional<OutputClash> outputClash(const Job &job, const QString &path);
/// The same for other outputs than the job's own.
std::optional<OutputClash> outputClash(const Job &job, const std::vector<Output> &outputs, const QString &path);

/// The files whose changes make another report of a job, with their complete names: the job file, its template file and its
/// data files. They need not exist.
/// @param path  the job file; empty for a job that is in no file
QStringList watchedFiles(const Job &job, const QString &path);

/// Whether every output of a job is a file that was written later than all that the job is made of was changed: the job
/// file, its template file and its data files. A file with the very time of an output counts as changed after it. A job
/// with standard output among its outputs, or with data that is in no file, is never up to date.
/// @param path  the job file; empty for a job that is in no file
bool isUpToDate(const Job &job, const QString &path);

} // namespace kareport
