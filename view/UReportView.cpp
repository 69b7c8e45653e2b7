#include "UReportView.h"

#include "COneViewPane.h"
#include "PrintRun.h"
#include "ReportChange.h"
#include "ReportContent.h"
#include "ReportEdit.h"
#include "ReportEntry.h"
#include "ReportExit.h"
#include "ReportViewWidget.h"
#include "RichTextWriter.h"
#include "SingleByteText.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UXTPMDIFrameWnd.h"

#include <QApplication>
#include <QTextBlock>
#include <QTextDocument>

using kareport::ReportChange;
using kareport::ReportEdit;
using kareport::ReportViewWidget;

namespace
{

/// Shorter texts are loaded before anybody notices.
constexpr qint64 shortestPieced = 500'000;
constexpr qint64 longestRichTextHead = 64;

} // namespace

UReportView::UReportView()
{
    auto *widget = new ReportViewWidget;
    widget_ = widget;
    edit_ = &widget->edit();
    widget->setLinesPerPage([this] { return GetDocument() != nullptr ? GetDocument()->GetLinesPerPage() : 0; });
    widget->setPageStarts([this] { return pageStartLines(); });
    widget->setPressHandler([this] { OnMouseActivate(); });
    widget->setShowHandler([this] { noteShown(); });
    edit_->setFocusHandler([this] { OnSetFocus(); });
    edit_->setEditHandler([this](const ReportChange &change) { takeEdit(change); });
    commands_ = makeCommands();
}

UReportView::~UReportView()
{
    OnDestroy();
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
        frame->GetRibbonBar().RemoveRibbonTabIndexForView(this);
    }
    if (widget_) {
        // It may be in the middle of the very key that closes the view.
        auto *widget = static_cast<ReportViewWidget *>(widget_.data());
        edit_->setFocusHandler({});
        edit_->setEditHandler({});
        edit_->setLoadHandler({});
        edit_->stopLoading();
        widget->setPressHandler({});
        widget->setShowHandler({});
        widget->setLinesPerPage({});
        widget->setPageStarts({});
        widget->hide();
        widget->setParent(nullptr);
        widget->deleteLater();
    }
}

UReportDoc *UReportView::GetDocument() const
{
    return dynamic_cast<UReportDoc *>(UView::GetDocument());
}

QWidget *UReportView::GetWidget()
{
    return widget_;
}

ReportEdit &UReportView::GetEdit() const
{
    return *edit_;
}

int UReportView::OnCreate()
{
    const UReportDoc *report = GetDocument();
    if (!widget_ || report == nullptr) {
        return -1;
    }
    edit_->setReportFont(kareport::reportFont(*report));
    return 0;
}

void UReportView::OnInitialUpdate()
{
    OnCreate();
    UView::OnInitialUpdate();
}

void UReportView::OnUpdate(UView *sender, long hint, void *hintObject)
{
    if (!widget_) {
        return; // the window has gone before its view, as it does with a frame that closes
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
        takeText();
        report->UpdateAllViews(this, 0, nullptr);
        return;
    }
    const QString text = kareport::shownText(*report);
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

void UReportView::noteLoaded()
{
    loadedLength_ = GetDocument()->GetTextLength();
    mirroredEdits_ = GetDocument()->GetEditCount();
}

void UReportView::noteShown()
{
    if (pane() == Pane::OwnHidden) {
        setPane(Pane::OwnShown); // whoever has shown it: if it is hidden again, that is not the report's doing
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
    // What a host appends meanwhile is shown with its next update. Any other change begins the load anew.
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
            UpdateData(true); // whoever waits for the whole text must not be handed a part of it
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
        return; // what was edited here has come back as the document's text: its formats stand in the control alone
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
    if (report != nullptr && widget_) {
        takeText();
        report->SetModifiedFlag(true); // before others hear of it: an editor that takes it may close the report
        report->UpdateAllViews(this, 0, nullptr);
    }
}

void UReportView::takeEdit(const ReportChange &change)
{
    UReportDoc *report = GetDocument();
    if (report == nullptr) {
        return;
    }
    const bool isReplaced =
        isMirrored_ && report->GetEditCount() == mirroredEdits_ &&
        report->GetTextLength() == change.documentLengthBefore() &&
        report->ReplaceText(change.documentPosition(), change.documentRemoved(), change.documentInserted());
    if (!isReplaced) {
        // Rich text, other line ends, or a text that was changed behind the view's back: the document takes over what
        // the control shows, and every further edit as the change it is.
        takeChanged(change);
        report->SetModifiedFlag(true);
    }
    noteTaken();
    followPages(change);
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
        return; // it has followed already, in a view that was told of the same edit twice
    }
    // A view that shows formats, or an image, shows another text than the one that was edited: what the document holds now
    // is plain.
    if (!showsFormats_ && edit_->applyChange(change)) {
        noteMirrored();
        followPages(change);
        return;
    }
    OnUpdate(nullptr, 0, nullptr);
}

void UReportView::OnSetFocus()
{
    UApplication *application = UApplication::Get();
    if (application == nullptr) {
        return;
    }
    if (application->GetCurrentReport() == nullptr) {
        application->SetCompanionView(nullptr);
        return;
    }
    UReportDoc *report = GetDocument();
    if (report != application->GetCurrentReport()) {
        application->SetCurrentReport(report);
        if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
            frame->SetActiveViewForFrameAndPane(this);
        }
    }
}

void UReportView::OnMouseActivate()
{
    // A pane that floats is still the frame's.
    const QWidget *ancestor = widget_;
    while (ancestor != nullptr && dynamic_cast<const UXTPMDIFrameWnd *>(ancestor) == nullptr) {
        ancestor = ancestor->parentWidget();
    }
    UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get();
    if (frame == nullptr || ancestor != frame) {
        return;
    }
    const CViewPane *pane = frame->GetActivePane();
    if (frame->GetActiveView() != this || pane != GetParentPane()) {
        frame->SetActiveViewForFrameAndPane(this); // another view, or a pane without one, had the keyboard
        return;
    }
    const QWidget *focus = QApplication::focusWidget();
    if (focus == nullptr || (focus != widget_ && !widget_->isAncestorOf(focus))) {
        OnActivateView(true, this, this);
    }
}

void UReportView::OnDestroy()
{
    if (UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get()) {
        frame->ResetActiveViewForFrameAndPane(this);
    }
}

void UReportView::OnReportExit()
{
    UReportDoc *report = GetDocument();
    if (report != nullptr && report->GetReportWindow() != nullptr) {
        kareport::deferCloseForExit(*report);
    }
    UXTPMDIFrameWnd *frame = UXTPMDIFrameWnd::Get();
    if (frame == nullptr || !frame->close()) {
        kareport::noteExitCancelled();
    }
}

void UReportView::OnSaveReportText()
{
    if (GetDocument() != nullptr) {
        GetDocument()->SaveText();
    }
}

bool UReportView::streamRichText(QIODevice &device) const
{
    if (widget_) {
        edit_->finishLoading();
    }
    return widget_ && kareport::writeRichText(device, *edit_->document());
}

bool UReportView::streamPlainText(QIODevice &device) const
{
    if (!widget_) {
        return false;
    }
    edit_->finishLoading();
    // Line by line, so that a long report is not copied as a whole.
    constexpr qsizetype pieceSize = 64 * 1024;
    QString piece;
    for (QTextBlock block = edit_->document()->begin(); block.isValid(); block = block.next()) {
        piece += block.text().replace(QChar::LineSeparator, QLatin1Char('\n'));
        if (block.next().isValid()) {
            piece += u'\n';
        }
        if (piece.size() >= pieceSize) {
            if (!kareport::writeSingleByteText(device, piece, kareport::WideCharacters::QuestionMark)) {
                return false;
            }
            piece.resize(0);
        }
    }
    return kareport::writeSingleByteText(device, piece, kareport::WideCharacters::QuestionMark);
}
