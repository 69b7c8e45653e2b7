#pragma once

#include <QString>

class UReportDoc;

namespace kareport
{

/// The user's editor that a report is opened in; empty for none. A report that has lost text is opened in none: here it
/// is known for what it is, an editor would take it for a whole one.
QString editorOf(const UReportDoc &report);

/// Saves a report under a temporary name and opens it in an editor, as rich text where the editor is a word processor. The
/// report's pane is hidden, unless the report closes as soon as it is in the editor.
/// @return false, with nothing done, when memory ran out before
bool openInEditor(UReportDoc &report, const QString &editor);
/// The same with what was written in rich-text mode, for a word processor. The report's pane stays as it is.
void openWrittenInEditor(UReportDoc &report, const QString &editor);
/// Opens a file in which a report was saved in the user's editor, if the report is marked for it.
void openSavedFile(UReportDoc &report, const QString &path);

} // namespace kareport
