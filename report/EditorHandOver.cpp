#include "EditorHandOver.h"

#include "CViewPane.h"
#include "EditorKind.h"
#include "EditorLauncher.h"
#include "Folders.h"
#include "PreferredEditor.h"
#include "PrivateFile.h"
#include "ReportViews.h"
#include "UReportDoc.h"

#include <QFile>

#include <utility>

namespace kareport
{

namespace
{

void startEditor(const QString &editor, const QString &file, UDocument &report)
{
    if (!file.isEmpty()) {
        launchEditor(editor, file, GetTempDir(false), &report);
    }
}

/// Saves under a temporary name, or under the next one that is free, in a file that only the user can read.
/// @return the name; empty when no name is free
QString saveForEditor(UReportDoc &report, QString name)
{
    // An empty report makes no file, so it needs no place for one.
    while (!report.IsEmpty() && !makePrivateFile(name)) {
        if (!isNameTaken(name)) {
            return name; // any name will do: there is no folder to write to
        }
        const QString taken = std::exchange(name, report.GetCurrentReportFileName());
        if (name == taken) {
            return QString(); // all names are, and the file there is not the report
        }
    }
    report.OnSaveDocument(name);
    return name;
}

/// Writes the rich-text image next to a temporary name. @return the file; empty when it cannot be written
QString writeRichTextForEditor(const UReportDoc &report, const QString &name)
{
    QFile file(QString(name).replace(QStringLiteral(".rep"), QStringLiteral(".rtf")));
    const QString stem = file.fileName().first(file.fileName().lastIndexOf(u'.'));
    for (int number = 1; !openPrivateFile(file); ++number) {
        if (!isNameTaken(file.fileName())) {
            return QString();
        }
        file.setFileName(stem + u'_' + QString::number(number) + QStringLiteral(".rtf"));
    }
    if (!report.WriteRichTextFile(file) || !file.flush()) {
        file.remove();
        return QString();
    }
    return file.fileName();
}

} // namespace

QString editorOf(const UReportDoc &report)
{
    return report.GetExternalEditorFlag() && !report.HasLostText() ? availableEditor() : QString();
}

bool openInEditor(UReportDoc &report, const QString &editor)
{
    const QString name = report.GetCurrentReportFileName();
    if (name.isEmpty()) {
        return false;
    }
    const QString file = saveForEditor(report, name);
    CViewPane *frame = report.GetFrameWindow();
    if (frame != nullptr && !report.GetCloseDocumentFlag()) {
        showReportPane(*frame, false);
    }
    if (report.IsConvertToOpenInWord(file, editor)) {
        report.ConvertAndOpenInWord();
    } else {
        startEditor(editor, file, report);
    }
    return true;
}

void openWrittenInEditor(UReportDoc &report, const QString &editor)
{
    const QString name = report.GetCurrentReportFileName();
    if (name.isEmpty()) {
        return; // memory ran out
    }
    const bool takesRichText = editorKind(editor, report.IsOptionExcel()) == EditorKind::WordProcessor;
    const QString richText = takesRichText ? writeRichTextForEditor(report, name) : QString();
    startEditor(editor, richText.isEmpty() ? saveForEditor(report, name) : richText, report);
}

void openSavedFile(UReportDoc &report, const QString &path)
{
    // Here, and only here, blanks around the path that the user has entered do no harm.
    const QString editor = preferredEditor().trimmed();
    if (report.GetExternalEditorFlag() && IsFileExisting(editor) != 0) {
        launchEditor(editor, path, QString(), &report);
    }
}

} // namespace kareport
