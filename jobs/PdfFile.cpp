#include "PdfFile.h"

#include "ReportPages.h"
#include "UReportDoc.h"

#include <QByteArray>
#include <QFile>
#include <QFileInfo>

namespace kareport
{

bool isPdfName(const QString &path)
{
    return path.endsWith(u".pdf", Qt::CaseInsensitive);
}

bool isPdfFile(const QString &path)
{
    constexpr char firstBytes[] = "%PDF-";
    constexpr qint64 length = sizeof firstBytes - 1;
    QFile file(path);
    return isPdfName(path) ||
           (QFileInfo(path).isFile() && file.open(QIODevice::ReadOnly) && file.read(length) == firstBytes);
}

bool makesNoPage(const UReportDoc &report)
{
    return report.IsEmpty() || (report.HoldsRichTextSource() && report.GetPages().empty());
}

} // namespace kareport
