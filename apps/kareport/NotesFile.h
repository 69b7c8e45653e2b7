#pragma once

#include "JobNotes.h"
#include "OutputFolders.h"

#include <QString>

#include <optional>

namespace kareport
{

/// What is wrong with the name of a file for notes; nothing for none.
/// @param areSeveral  the notes on several jobs go to it
std::optional<QString> wrongNotesFile(const std::optional<QString> &file, bool areSeveral);

/// The name of an output of a job, in which "{}" is replaced by the name of the job file. It stays as it is where the job is in no
/// file.
QString namedAfterJob(QString name, const QString &jobFile);

/// Writes the notes on a job to a file, and says on standard error why that was not possible. @return whether it was
bool writeNotesFile(const JobNotes &notes, const QString &file, const OutputFolders &folders);

} // namespace kareport
