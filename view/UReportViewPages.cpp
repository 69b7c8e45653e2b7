#include "UReportView.h"

#include "LineEndings.h"
#include "PageHeader.h"
#include "ReportChange.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "ReportViewWidget.h"
#include "UReportDoc.h"

#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>

using kareport::ReportChange;
using kareport::ReportViewWidget;

namespace
{

std::vector<int> asLines(const std::vector<qint64> &lines, int lineCount)
{
    std::vector<int> shown;
    for (const qint64 line : lines) {
        if (line < lineCount) {
            shown.push_back(static_cast<int>(line));
        }
    }
    return shown;
}

/// The blocks of a control that pages of a text begin with. Other line ends than CR LF are one character there.
std::vector<int> blocksOfStarts(const QString &text, const std::vector<qint64> &starts)
{
    std::vector<int> blocks;
    int block = 0;
    qint64 at = 0;
    for (const qint64 start : starts) {
        for (; at < std::min<qint64>(start, text.size()); ++at) {
            const QChar character = text[at];
            const bool isPairsFirst = character == u'\r' && at + 1 < text.size() && text[at + 1] == u'\n';
            block +=
                (character == u'\r' && !isPairsFirst) || character == u'\n' || character == QChar::ParagraphSeparator
                    ? 1
                    : 0;
        }
        if (at < text.size() && (at == 0 || text[at - 1] == u'\n')) {
            blocks.push_back(block);
        }
    }
    return blocks;
}

} // namespace

std::vector<int> UReportView::pageStartLines() const
{
    const UReportDoc *report = GetDocument();
    if (report == nullptr || !widget_) {
        return {};
    }
    const int lineCount = edit_->document()->blockCount();
    // Lines of the text are lines here, unless what is shown is another text: the document of a source, or an image that
    // was begun after the text.
    const bool isImage = report->GetRTFDataFlag();
    if (report->HoldsRichTextSource() || (isImage && report->CopyText().count(u'\n') + 1 != lineCount)) {
        const QString shown = edit_->windowText();
        return asLines(kareport::linesOfStarts(shown, kareport::pageHeadersIn(shown)), lineCount);
    }
    if (!isImage && !isMirrored_ && !edit_->isLoading()) {
        return blocksOfStarts(report->CopyText(), report->GetPageStarts());
    }
    // Found once, also while the control gets its text piece by piece.
    if (startLinesLength_ != report->GetTextLength() || startLinesEdits_ != report->GetEditCount()) {
        startLines_ = report->GetPageStartLines();
        startLinesLength_ = report->GetTextLength();
        startLinesEdits_ = report->GetEditCount();
    }
    return asLines(startLines_, lineCount);
}

void UReportView::forgetPages()
{
    startLinesLength_ = -1;
    static_cast<ReportViewWidget *>(widget_.data())->forgetPages();
}

void UReportView::followPages(const ReportChange &change)
{
    auto &widget = *static_cast<ReportViewWidget *>(widget_.data());
    if (!isMirrored_) {
        widget.forgetPages();
        return;
    }
    const std::vector<qint64> &starts = GetDocument()->GetPageStarts();
    const int added = edit_->document()->blockCount() - 1 - change.lineEndsInAll + change.lineEndsRemoved;
    std::vector<int> lines;
    int line = change.lineEndsBefore;
    for (QTextBlock block = edit_->document()->findBlockByNumber(line); line <= change.lineEndsBefore + added;
         block = block.next(), ++line)
    {
        // In the document every line end before the line is one character more.
        if (std::binary_search(starts.begin(), starts.end(), qint64(block.position()) + line)) {
            lines.push_back(line);
        }
    }
    widget.followEdit(change, lines);
}

bool UReportView::carryThrough(const ReportChange &change)
{
    // The document holds the control's text with other line ends: it is given the control's, and then the change, so that
    // its pages are carried along.
    UReportDoc &report = *GetDocument();
    const QString before = kareport::withCrLf(report.CopyText());
    const QString after = edit_->windowText();
    const QString inserted = change.documentInserted();
    const qint64 at = change.documentPosition();
    const qint64 behind = at + change.documentRemoved();
    const bool isOne = before.size() == change.documentLengthBefore() && behind <= before.size() &&
                       QStringView(before).first(at) == QStringView(after).first(at) &&
                       QStringView(before).sliced(behind) == QStringView(after).sliced(at + inserted.size());
    if (!isOne || report.HoldsRichTextSource()) {
        return false;
    }
    std::vector<qint64> starts = kareport::startsOfLines(before, report.GetPageStartLines());
    report.SetData(before);
    report.SetPageStarts(std::move(starts));
    return report.ReplaceText(at, change.documentRemoved(), inserted);
}

void UReportView::takeText()
{
    UReportDoc &report = *GetDocument();
    const QString before = report.CopyText();
    const std::vector<qint64> lines = report.GetPageStartLines();
    const QString text = edit_->windowText();
    report.SetData(text);
    if (kareport::withCrLf(before) == text) {
        report.SetPageStarts(kareport::startsOfLines(text, lines));
    }
}
