#pragma once

#include "InputError.h"

#include <QStringList>

#include <optional>

namespace kareport
{

/// The part of a list of jobs that one process takes, so that several processes or machines share the list.
struct JobSlice
{
    qsizetype number = 1; ///< from 1 to `count`
    qsizetype count = 1;

    /// Reads "3/8", the third of eight. @return nothing for another text, or a number that is not within the count
    static std::optional<JobSlice> fromText(const QString &text);
    /// Every `count`-th job, beginning with the `number`-th: neighbouring jobs are often similar, and go to
    /// different slices. The slices of one list have each job once between them; a slice may be empty.
    QStringList of(const QStringList &jobs) const;
};

/// Reads the names of job files, one a line; blank lines are skipped. Where the list holds a 0 byte, the names are
/// separated by these instead; line ends are then part of the names, and the last name must end with a 0 byte as well, so
/// that a 0 byte that got into a line is told from that. Names are relative to the current folder, wherever the list is.
/// @param path  "-" for standard input
Expected<QStringList> readJobList(const QString &path);

} // namespace kareport
