#pragma once

#include "InputError.h"
#include "JobNotes.h"
#include "JsonSource.h"
#include "Progress.h"
#include "StepFit.h"

#include <QString>

#include <vector>

namespace kareport
{

/// Something that a check says about a file.
struct CheckRemark
{
    bool isError;
    InputError about;
};

/// What was found in a file.
struct CheckedFile
{
    QString file;
    bool isJob = false;
    bool isStopped = false;         ///< by an interrupt
    bool isNotesFileNeeded = false; ///< the notes would take the place of a file that the job needs
    std::vector<CheckRemark> remarks;
    std::vector<StepFit> steps; ///< of a job
    JobNotes notes;             ///< the same

    void add(bool isError, const InputError &about) { remarks.push_back({isError, about}); }
    bool hasErrors() const;
};

/// Checks a template file.
CheckedFile checkTemplateFile(const QString &file);

/// Checks a job with its template, its data and its steps: the report is made and discarded, in one pass over the data.
/// @param file       the name of the job in messages
/// @param source     the job file, or why it could not be read
/// @param isStrict   what the report notes is an error, also where the job does not say so
/// @param notesFile  the file that the notes are to be written to; empty for none. One that is needed for the job is an error
CheckedFile checkJob(const QString &file, const Expected<JsonSource> &source, bool isStrict, const QString &notesFile,
                     Progress &progress);

} // namespace kareport
