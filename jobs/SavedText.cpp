#include "SavedText.h"

#include "PageHeader.h"
#include "UReportDoc.h"

namespace kareport
{

std::optional<int> linesOfPages(QStringView text)
{
    return linesBetweenPageHeaders(text);
}

void writeLines(UReportDoc &report, QStringView text)
{
    while (!text.isEmpty()) {
        const qsizetype feed = text.indexOf(u'\n');
        QStringView line = text.first(feed < 0 ? text.size() : feed);
        text = text.sliced(feed < 0 ? text.size() : feed + 1);
        if (feed >= 0 && line.endsWith(u'\r')) {
            line.chop(1);
        }
        report.Write(line.toString(), 0);
        report.LineFeed(feed < 0 ? 0 : 1);
    }
}

} // namespace kareport
