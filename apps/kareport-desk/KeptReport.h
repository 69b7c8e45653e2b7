#pragma once

#include <QString>

#include <vector>

class UReportDoc;

namespace kareport
{

struct ReadNotes;

/// An open report as it is kept on the disk.
struct KeptReport
{
    QString title;
    QString path;                       ///< of its file; empty for a report that has none
    QString textFile;                   ///< holds what was not saved; empty when the report's own file holds all
    int linesPerPage = 0;               ///< of a page that was given; 0 for a measured one
    std::vector<qint64> pageLines = {}; ///< the lines that the pages of that text begin with, from 0

    /// The name that the user sees: a report that was opened from a file has no title.
    QString name() const;
    /// Whether the text that was kept of it is still there.
    bool holdsText() const;
};

/// Opens a report again that was open when a program crashed, with the changes that were not saved.
/// @param notes  may be null
/// @return null when it cannot be opened, there is no memory for it, or the user has stopped it
UReportDoc *reopenReport(const KeptReport &kept, ReadNotes *notes = nullptr);

} // namespace kareport
