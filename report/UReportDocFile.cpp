#include "UReportDoc.h"

#include "ReplaceFile.h"

bool UReportDoc::OnSaveDocument(const QString &path)
{
    const QStringView text = GetText();
    // An empty report is saved by doing nothing: no file is made and none is emptied.
    if (!text.isEmpty() && !kareport::replaceFile(path, [text](QIODevice &device) {
            return kareport::writeReportText(device, text, kareport::LineEnds::ReportFile);
        }))
    {
        return false;
    }
    SetModifiedFlag(false);
    return true;
}
