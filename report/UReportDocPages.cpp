#include "UReportDoc.h"

#include "PageHeader.h"
#include "ReportContent.h"
#include "RichTextReader.h"

#include <QByteArrayView>

#include <algorithm>
#include <new>

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
try {
    if (HoldsRichTextSource()) {
        const QString shown = kareport::shownPlainText(*this);
        return kareport::reportPages(QStringView(shown), kareport::pageHeadersIn(shown), GetLinesPerPage());
    }
    const kareport::ReportText &text = page_.text();
    return text.isNarrow() ? kareport::reportPages(text.narrowView(), GetPageStarts(), GetLinesPerPage())
                           : kareport::reportPages(text.view(), GetPageStarts(), GetLinesPerPage());
} catch (const std::bad_alloc &) {
    return {};
}

std::vector<qint64> UReportDoc::GetPageStartLines() const
try {
    const kareport::ReportText &text = page_.text();
    return text.isNarrow() ? kareport::linesOfStarts(text.narrowView(), GetPageStarts())
                           : kareport::linesOfStarts(text.view(), GetPageStarts());
} catch (const std::bad_alloc &) {
    return {};
}

bool UReportDoc::FindPageStarts(qint64 from)
try {
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
} catch (const std::bad_alloc &) {
    return false;
}
