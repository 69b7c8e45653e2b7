#include "ReportSaveName.h"

#include "AppMessageBox.h"
#include "Folders.h"
#include "SaveDialog.h"
#include "StandardText.h"
#include "Xlate.h"

namespace kareport
{

bool endsWithExtension(QStringView name, QStringView extension)
{
    const qsizetype at = name.indexOf(extension, 0, Qt::CaseInsensitive);
    return at >= 0 && at == name.size() - extension.size();
}

bool isRichTextName(QStringView name)
{
    return endsWithExtension(name, u".rtf");
}

bool isPdfName(QStringView name)
{
    return endsWithExtension(name, u".pdf");
}

std::optional<QString> askReportName(UDocument &document, bool richTextFirst)
{
    SaveRequest request;
    request.document = &document;
    request.defaultExtension = QStringLiteral("rep");
    request.initialFolder = GetInitialOpenDir(lastReportFolder);
    request.flags = SaveRequest::hideReadOnly | SaveRequest::overwritePrompt | SaveRequest::pathMustExist;
    request.filter = (richTextFirst ? Xlate("RTF Files (*.rtf)|*.rtf|Report Files (*.rep)|*.rep|PDF (*.pdf)|*.pdf|")
                                    : Xlate("Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|")) +
                     standardText(allFilesTitle) + QStringLiteral("|*.*||");
    auto chosen = askSaveName(request);
    if (chosen) {
        SetLastOpenDir(*chosen, lastReportFolder);
    }
    return chosen;
}

void sayNotSaved(const QString &path, const QString &reason)
{
    AppMessageBox(reason.isEmpty()
                      ? Xlate("\"%1\" could not be saved. Choose another folder, or make room on the disk.").arg(path)
                      : Xlate("\"%1\" could not be saved: %2.").arg(path, reason));
}

QString lostTextReason()
{
    return Xlate("a part of the report was lost when memory ran out");
}

QString emptyPdfReason()
{
    return Xlate("the report is empty, and a PDF has at least one page");
}

} // namespace kareport
