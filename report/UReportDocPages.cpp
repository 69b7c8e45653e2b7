#include "UReportDoc.h"

#include "MemoryLasts.h"
#include "PageHeader.h"
#include "ReportContent.h"
#include "RichTextReader.h"

#include <QByteArrayView>

#include <algorithm>

bool UReportDoc::HoldsRichTextSource() const
{
    if (GetRTFDataFlag()) {
        return false;
    }
    const kareport::ReportText &text = page_.text();
    return text.isNarrow() ? kareport::isRichText(QByteArrayView(text.narrowView()))
                           : kareport::isRichText(text.view());
}

std::vector<kareport::ReportPage> UReportDoc::GetPages() const
{
    return kareport::whileMemoryLasts(std::vector<kareport::ReportPage>(), [this] {
        if (HoldsRichTextSource()) {
            const QString shown = kareport::shownPlainText(*this);
            return kareport::reportPages(QStringView(shown), kareport::pageHeadersIn(shown), GetLinesPerPage());
        }
        const kareport::ReportText &text = page_.text();
        return text.isNarrow() ? kareport::reportPages(text.narrowView(), GetPageStarts(), GetLinesPerPage())
                               : kareport::reportPages(text.view(), GetPageStarts(), GetLinesPerPage());
    });
}

std::vector<qint64> UReportDoc::GetPageStartLines() const
{
    return kareport::whileMemoryLasts(std::vector<qint64>(), [this] {
        const kareport::ReportText &text = page_.text();
        return text.isNarrow() ? kareport::linesOfStarts(text.narrowView(), GetPageStarts())
                               : kareport::linesOfStarts(text.view(), GetPageStarts());
    });
}

bool UReportDoc::FindPageStarts(qint64 from)
{
    bool areFound = false;
    const bool isLooked = kareport::doneWhileMemoryLasts([&] { areFound = findPageStarts(from); });
    if (!isLooked) {
        page_.noteLostText(); // the text is whole, its pages are not
    }
    return areFound;
}

bool UReportDoc::findPageStarts(qint64 from)
{
    if (from < 0 || from >= GetTextLength() || HoldsRichTextSource()) {
        return false; // the lines of a source are not those that it shows
    }
    const kareport::ReportText &text = page_.text();
    std::vector<qint64> found = text.isNarrow() ? kareport::pageHeadersIn(text.narrowView().sliced(from))
                                                : kareport::pageHeadersIn(text.view().sliced(from));
    if (found.empty()) {
        return false;
    }
    std::vector<qint64> starts = GetPageStarts();
    starts.erase(std::lower_bound(starts.begin(), starts.end(), from), starts.end());
    for (const qint64 header : found) {
        starts.push_back(from + header);
    }
    SetPageStarts(std::move(starts));
    return true;
}
