#include "UReportView.h"

#include "ControlLines.h"
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

} // namespace

std::vector<int> UReportView::pageStartLines() const
{
    if (GetDocument() == nullptr || !widget_) {
        return {};
    }
    const QTextDocument &document = *edit_->document();
    if (isMirrored_ && !isStale() && !GetDocument()->HoldsRichTextSource()) {
        return kareport::blocksAt(document, GetDocument()->GetPageStarts());
    }
    const int lineCount = document.blockCount();
    if (const auto lines = recordedStartLines(lineCount)) {
        return *lines;
    }
    const QString shown = edit_->windowText();
    return asLines(kareport::linesOfStarts(shown, kareport::pageHeadersIn(shown)), lineCount);
}

std::optional<std::vector<int>> UReportView::recordedStartLines(int lineCount) const
{
    // Lines of the text are lines here, unless what is shown is another text: the document of a source, or an image that
    // was begun after the text.
    const UReportDoc &report = *GetDocument();
    const bool isImage = report.GetRTFDataFlag();
    if (report.HoldsRichTextSource() || (isImage && !kareport::hasLines(report.CopyText(), lineCount))) {
        return std::nullopt;
    }
    if (!isImage && !isMirrored_ && !edit_->isLoading()) {
        return kareport::blocksOfStarts(report.CopyText(), report.GetPageStarts());
    }
    // Found once, also while the control gets its text piece by piece.
    if (startLinesLength_ != report.GetTextLength() || startLinesEdits_ != report.GetEditCount()) {
        startLines_ = report.GetPageStartLines();
        startLinesLength_ = report.GetTextLength();
        startLinesEdits_ = report.GetEditCount();
    }
    return asLines(startLines_, lineCount);
}

void UReportView::forgetPages()
{
    startLinesLength_ = -1;
    static_cast<ReportViewWidget *>(widget_.data())->forgetPages();
    OnPagesForgotten();
}

void UReportView::OnPagesForgotten() {}

void UReportView::OnTextEdited(const ReportChange & /*change*/) {}

void UReportView::followPages(const ReportChange &change)
{
    auto &widget = *static_cast<ReportViewWidget *>(widget_.data());
    if (!isMirrored_) {
        widget.forgetPages();
        OnTextEdited(change);
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
    OnTextEdited(change);
}

bool UReportView::carryThrough(const ReportChange &change)
{
    // The document holds the control's text with other line ends: it is given the control's, and then the change, so that
    // its pages are carried along.
    UReportDoc &report = *GetDocument();
    kareport::ControlText before = kareport::controlText(report.CopyText(), report.GetPageStarts());
    const QString after = edit_->windowText();
    const QString inserted = change.documentInserted();
    const qint64 at = change.documentPosition();
    const qint64 stop = at + change.documentRemoved();
    const bool isOne = before.text.size() == change.documentLengthBefore() && stop <= before.text.size() &&
                       QStringView(before.text).first(at) == QStringView(after).first(at) &&
                       QStringView(before.text).sliced(stop) == QStringView(after).sliced(at + inserted.size());
    if (!isOne || report.HoldsRichTextSource()) {
        return false;
    }
    report.SetData(before.text);
    report.SetPageStarts(std::move(before.starts));
    return report.ReplaceText(at, change.documentRemoved(), inserted);
}

std::optional<std::vector<qint64>> UReportView::startsAfter(const ReportChange &change) const
{
    const auto lines = isStale() ? std::nullopt : recordedStartLines(change.lineEndsInAll + 1);
    if (!lines) {
        return std::nullopt; // the headers in the text are all that is known
    }
    const QTextDocument &document = *edit_->document();
    const QString inserted = change.documentInserted();
    const qint64 at = change.documentPosition();
    const qint64 stop = at + inserted.size();
    const int lastRemoved = change.lineEndsBefore + change.lineEndsRemoved;
    const int growth = static_cast<int>(change.inserted.count(u'\n')) - change.lineEndsRemoved;
    const bool beginsLine = kareport::startOfBlock(document.findBlockByNumber(change.lineEndsBefore)) == at;
    // A line that is put in at a page's start is the page's before, and a page whose text before it is removed stays. A
    // start that is within a line then counts again when the line end comes back.
    const bool isPutBefore = change.removed == 0 && at > 0 && beginsLine && inserted.endsWith(u'\n');
    std::vector<qint64> starts;
    for (const int line : *lines) {
        if (line > lastRemoved) {
            starts.push_back(kareport::startOfBlock(document.findBlockByNumber(line + growth)));
        } else if (line > change.lineEndsBefore) {
            if (line == lastRemoved) {
                starts.push_back(stop);
            }
        } else {
            const qint64 start = kareport::startOfBlock(document.findBlockByNumber(line));
            starts.push_back(start == at && isPutBefore ? stop : start);
        }
    }
    for (const qint64 header : kareport::pageHeadersIn(inserted)) {
        if (header > 0 || beginsLine) {
            starts.push_back(at + header);
        }
    }
    return starts;
}

void UReportView::takeChanged(const ReportChange &change)
{
    if (carryThrough(change)) {
        return;
    }
    std::optional<std::vector<qint64>> starts = startsAfter(change);
    GetDocument()->SetData(edit_->windowText());
    if (starts) { // also none: a header line that begins no page is an ordinary line
        GetDocument()->SetPageStarts(std::move(*starts));
    }
}

void UReportView::takeText()
{
    UReportDoc &report = *GetDocument();
    const QString text = edit_->windowText(); // all of it has been loaded then
    const QTextDocument &document = *edit_->document();
    const bool isKnown = !isStale();
    std::vector<qint64> starts;
    if (isKnown) {
        for (const int line : pageStartLines()) {
            starts.push_back(kareport::startOfBlock(document.findBlockByNumber(line)));
        }
    }
    report.SetData(text);
    if (isKnown) { // also none: a header line that begins no page is an ordinary line
        report.SetPageStarts(std::move(starts));
    }
    noteTaken();
}
