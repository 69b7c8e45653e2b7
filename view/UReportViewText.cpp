#include "UReportView.h"

#include "ReportChange.h"
#include "ReportContent.h"
#include "ReportEdit.h"
#include "ReportViewWidget.h"
#include "UReportDoc.h"

#include <QTextDocument>

#include <optional>
#include <utility>

using kareport::ReportChange;
using kareport::ReportEdit;

namespace
{

/// Shorter texts are loaded before the user notices.
constexpr qint64 shortestPieced = 500'000;
constexpr qint64 longestRichTextHead = 64;

} // namespace

void UReportView::OnUpdate(UView *sender, long hint, void *hintObject)
{
    if (!widget_) {
        return; // the window was destroyed before its view, as when a frame closes
    }
    const auto *edited = hint == 0 && hintObject == nullptr ? dynamic_cast<const UReportView *>(sender) : nullptr;
    if (edited != nullptr && edited->toldChange_ != nullptr) {
        followEdit(*edited->toldChange_);
        return;
    }
    m_nWordWrap = WrapNone;
    WrapChanged();
    if (!loadInPieces()) {
        UpdateData(true);
    }
    UView::OnUpdate(sender, hint, hintObject);
}

void UReportView::WrapChanged()
{
    edit_->setLineWrapMode(m_nWordWrap == WrapToWindow ? ReportEdit::WidgetWidth : ReportEdit::NoWrap);
}

void UReportView::UpdateData(bool toView)
{
    UReportDoc *report = GetDocument();
    if (report == nullptr || !widget_) {
        return;
    }
    if (!toView) {
        if (isUnread_) {
            return;
        }
        takeText();
        report->UpdateAllViews(this, 0, nullptr);
        return;
    }
    const std::optional<QString> shown = kareport::shownText(*report);
    if (!shown) {
        noteUnread();
        return;
    }
    const QString &text = *shown;
    const WordWrap wrap = kareport::isRichText(text) ? WrapToWindow : WrapNone;
    if (m_nWordWrap != wrap) {
        m_nWordWrap = wrap;
        WrapChanged();
    }
    SetRTFText(text);
    if (!report->GetRTFDataFlag() && wrap == WrapNone) {
        noteMirrored();
    }
    noteLoaded();
    forgetPages();
}

/// There was no memory for the report's text. What the control shows is another one: an edit of that would take the report's
/// place. The next update tries again.
void UReportView::noteUnread()
{
    edit_->stopLoading();
    edit_->setReadOnly(true);
    edit_->document()->setUndoRedoEnabled(false);
    isUnread_ = true;
    isMirrored_ = false;
    loadedLength_ = -1;
    forgetPages();
}

void UReportView::noteLoaded()
{
    if (std::exchange(isUnread_, false)) {
        edit_->setReadOnly(false);
    }
    loadedLength_ = GetDocument()->GetTextLength();
    mirroredEdits_ = GetDocument()->GetEditCount();
}

void UReportView::noteShown()
{
    if (pane() == Pane::OwnHidden) {
        setPane(Pane::OwnShown); // other code has shown it: if it is hidden again, the report did not do it
    }
    loadIfStale();
}

void UReportView::loadIfStale()
{
    // A pane that was hidden while its report was written shows another text than the report's: an edit of that would take
    // the report's place.
    if (GetDocument() != nullptr && isStale()) {
        OnUpdate(nullptr, 0, nullptr);
    }
}

bool UReportView::isStale() const
{
    return GetDocument()->GetTextLength() != loadedLength_ || GetDocument()->GetEditCount() != mirroredEdits_;
}

bool UReportView::loadInPieces()
{
    const UReportDoc *report = GetDocument();
    if (!loadsInPieces_ || report == nullptr || report->GetRTFDataFlag() || report->GetTextLength() < shortestPieced ||
        kareport::isRichText(report->CopyText(0, longestRichTextHead)))
    {
        return false;
    }
    isMirrored_ = false;
    showsFormats_ = false;
    noteLoaded();
    forgetPages();
    // What a host appends meanwhile is shown with its next update. Any other change starts the load again.
    const quint64 edits = report->GetEditCount();
    const auto read = [report, edits](qint64 at, qint64 count) {
        const bool isSame = UReportDoc::IsReportAvailable(report) && report->GetEditCount() == edits;
        return isSame ? report->CopyText(at, count) : QString();
    };
    const qint64 length = report->GetTextLength();
    edit_->loadPlainTextInPieces({length, read}, [this, edits, length](bool isWhole) {
        if (GetDocument() == nullptr) {
            return;
        }
        if (!isWhole || GetDocument()->GetEditCount() != edits) {
            UpdateData(true); // code that waits for the whole text must not get a part of it
        } else {
            noteMirrored();
            loadedLength_ = length;
        }
    });
    return true;
}

void UReportView::noteMirrored()
{
    // A line end of one character in the document makes the lengths differ: only texts whose lines all end with CR LF
    // are as long there as here.
    const UReportDoc *report = GetDocument();
    isMirrored_ = report->GetTextLength() == edit_->windowTextLength();
    noteLoaded();
}

void UReportView::noteTaken()
{
    noteMirrored();
    takenEdits_ = GetDocument()->GetEditCount();
}

void UReportView::SetRTFText(const QString &text)
{
    isMirrored_ = false;
    const bool isTakenFromHere = GetDocument() != nullptr && takenEdits_ == GetDocument()->GetEditCount();
    if (showsFormats_ && isTakenFromHere && text == edit_->windowText()) {
        return; // what was edited here has come back as the document's text: its formats are in the control alone
    }
    showsFormats_ = kareport::isRichText(text);
    if (showsFormats_) {
        const UReportDoc *report = GetDocument();
        edit_->loadRichText([report, &text](QTextDocument &loaded) {
            return report != nullptr ? kareport::readShownRichText(*report, text, loaded)
                                     : kareport::readRichText(text, loaded);
        });
    } else {
        edit_->loadPlainText(text);
    }
}

void UReportView::OnChange()
{
    UReportDoc *report = GetDocument();
    if (report != nullptr && widget_ && !isUnread_) {
        takeText();
        report->SetModifiedFlag(true); // before others hear of it: an editor that takes it may close the report
        report->UpdateAllViews(this, 0, nullptr);
    }
}

void UReportView::takeEdit(const ReportChange &change)
{
    UReportDoc *report = GetDocument();
    if (report == nullptr || isUnread_) {
        return;
    }
    const bool isReplaced =
        isMirrored_ && report->GetEditCount() == mirroredEdits_ &&
        report->GetTextLength() == change.documentLengthBefore() &&
        report->ReplaceText(change.documentPosition(), change.documentRemoved(), change.documentInserted());
    if (!isReplaced) {
        // Rich text, other line ends, or a text that was changed without the view being notified: the document takes
        // over what the control shows, and every further edit as the change it is.
        takeChanged(change);
        report->SetModifiedFlag(true);
    }
    noteTaken();
    followPages(change);
    // A report that is marked for the user's editor is opened there with every edit, each time as a new file: that is what
    // an update of its views does, and it may close the report and this view.
    const std::weak_ptr<UView *const> self = GetHandle();
    toldChange_ = &change;
    report->UpdateAllViews(this, 0, nullptr);
    if (const auto handle = self.lock(); handle && *handle == this) { // an editor that took it may have closed it
        toldChange_ = nullptr;
    }
}

void UReportView::followEdit(const ReportChange &change)
{
    const UReportDoc *report = GetDocument();
    if (report == nullptr || (isMirrored_ && !isStale())) {
        return; // it has followed already, in a view that was notified of the same edit twice
    }
    // A view that shows formats, or an image, shows another text than the one that was edited: what the document holds now
    // is plain. An edit of its head may have made it rich text.
    const bool isRich = change.documentPosition() < longestRichTextHead && report->HoldsRichTextSource();
    if (!showsFormats_ && !isUnread_ && !isRich && edit_->applyChange(change)) {
        noteMirrored();
        followPages(change);
        return;
    }
    OnUpdate(nullptr, 0, nullptr);
}
