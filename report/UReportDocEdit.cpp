#include "UReportDoc.h"

bool UReportDoc::ReplaceText(qint64 at, qint64 removed, QStringView inserted)
{
    if (!page_.replace(at, removed, inserted)) {
        return false;
    }
    if (removed > 0 || !inserted.isEmpty()) {
        ++editCount_;
        SetModifiedFlag(true);
    }
    return true;
}

QString UReportDoc::CopyText() const
{
    const kareport::ReportText &text = page_.text();
    return text.isNarrow() ? text.narrowView().toString() : text.view().toString();
}
