#pragma once

#include <QStringView>

namespace kareport
{

/// What a report is made into for an editor.
enum class EditorKind
{
    Plain,        ///< takes the report text
    WordProcessor ///< takes rich text
};

/// The name of an editor's program without folders and without what follows its last ".". Folders end with "/" or "\" on
/// every platform: a user's preferences may come from another one.
QStringView editorStem(QStringView path);

/// Whether the program is the spreadsheet that can take the place of a word processor.
bool isExcelEditor(QStringView path);

/// The kind of an editor by the name of its program, in any case. @param excelOption  whether the report may go to the
/// spreadsheet as to a word processor
EditorKind editorKind(QStringView path, bool excelOption);

} // namespace kareport
