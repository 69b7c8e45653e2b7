#include "UReportDoc.h"

#include "ReplaceFile.h"

bool UReportDoc::WriteText(QIODevice &device, kareport::LineEnds lineEnds) const
{
    const kareport::ReportText &text = page_.text();
    return text.isNarrow() ? kareport::writeReportText(device, text.narrowView(), lineEnds)
                           : kareport::writeReportText(device, text.view(), lineEnds);
}

bool UReportDoc::OnSaveDocument(const QString &path)
{
    // An empty report is saved by doing nothing: no file is made and none is emptied.
    if (!IsEmpty() && !kareport::replaceFile(path, [this](QIODevice &device) {
            return WriteText(device, kareport::LineEnds::ReportFile);
        }))
    {
        return false;
    }
    SetModifiedFlag(false);
    return true;
}
