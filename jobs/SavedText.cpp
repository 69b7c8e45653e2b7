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
        const bool isEnded = feed >= 0 && line.endsWith(u'\r');
        if (isEnded) {
            line.chop(1);
        }
        const bool isBare = feed >= 0 && !isEnded; // a line feed alone stays one
        report.Write(isBare ? line.toString() + u'\n' : line.toString(), 0);
        report.LineFeed(isEnded ? 1 : 0);
    }
}

} // namespace kareport
