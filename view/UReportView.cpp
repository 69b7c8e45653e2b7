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
        // It may be handling the key press that closes the view.
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

void UReportView::finishLoading()
{
    if (widget_) {
        edit_->finishLoading();
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
    constexpr qsizetype pieceSize = qsizetype(64) * 1024;
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
