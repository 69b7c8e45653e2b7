#pragma once

#include "InputError.h"
#include "JobReader.h"
#include "ReportRecipe.h"

#include <QByteArray>
#include <QString>

#include <optional>

namespace kareport
{

/// The job file that makes a report again wherever it is read: what the defaults of this program say for it is in it, and the
/// names of files are relative to its folder. A job that was in no file gets an output of its own name, as a proposal.
/// @param defaults  those that the report was made with
/// @param path      of the file, with its complete name; its folder is there
/// @return the file's content; an error where the job cannot be read, or the file would take the place of its data, of its
///         template or of one of its outputs
Expected<QByteArray> jobFileOf(const ReportRecipe &recipe, const JobDefaults &defaults, const QString &path);

/// Writes that file, in one step. @return what is wrong; nothing when it was written
std::optional<InputError> saveJob(const ReportRecipe &recipe, const JobDefaults &defaults, const QString &path);

} // namespace kareport
