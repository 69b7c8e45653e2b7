#pragma once

#include <QString>
#include <QStringList>

class UReportDoc;

namespace kareport
{

/// Why a file cannot be opened; empty when it may be tried. Reading a pipe or a device might never end.
QString whyNotOpened(const QString &path);
/// The remarks on a file that was read.
struct ReadNotes
{
    bool isStopped = false; ///< by the user; there is no further message
    QString problem; ///< why it was not read, as a part of a sentence; empty where it was, or where nothing is known
    QStringList warnings; ///< sentences about what the file holds and the report does not show
};

/// Opens a saved report in a pane. The windows answer while a long file is read: the report is there once it has been.
/// @param notes  may be null
/// @return null when it cannot be opened or was stopped
UReportDoc *openSavedReport(const QString &path, ReadNotes *notes = nullptr);
/// Replaces what a report holds by its file. @param notes  may be null
/// @return false, with the report as it was, when the file cannot be read or that was stopped; the report may have been
/// closed meanwhile
bool reloadSavedReport(UReportDoc &report, ReadNotes *notes = nullptr);

} // namespace kareport
