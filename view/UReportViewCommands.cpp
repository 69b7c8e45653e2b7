#include "UReportView.h"

#include "ReportCommandIds.h"
#include "ReportEdit.h"
#include "ReportViewWidget.h"
#include "UReportDoc.h"

#include <QTextDocument>

using kareport::Command;
using kareport::CommandState;
using kareport::ReportEdit;
using kareport::ReportViewWidget;

namespace
{

template <typename Act>
Command editCommand(unsigned id, ReportEdit &edit, Act act, std::function<void(CommandState &)> update = {})
{
    return {id, [&edit, act] { (edit.*act)(); }, std::move(update)};
}

void closeReport(UReportDoc *report)
{
    if (report != nullptr && report->EnableCloseOption() && report->SaveModified() &&
        UReportDoc::IsReportAvailable(report)) {
        report->OnCloseDocument();
    }
}

} // namespace

const std::vector<Command> &UReportView::commands() const
{
    static const std::vector<Command> none;
    return widget_ ? commands_ : none; // they act on the window
}

void UReportView::OnUpdateCloseCmdUI(CommandState &state) const
{
    state.enabled = GetDocument() == nullptr || GetDocument()->EnableCloseOption();
}

std::vector<Command> UReportView::makeCommands()
{
    using namespace kareport;
    const auto print = [this] { OnReportPrint(); };
    const auto preview = [this] { OnReportPrintPreview(); };
    const auto alwaysEnabled = [](CommandState &state) { state.enabled = true; };
    const auto closeState = [this](CommandState &state) { OnUpdateCloseCmdUI(state); };
    ReportEdit &edit = GetEdit();
    auto *widget = static_cast<ReportViewWidget *>(widget_.data());
    return {
        {filePrintCommand, print, alwaysEnabled},
        {printPreviewCommand, preview, {}},
        {hostPrintCommand, print, alwaysEnabled},
        {printDirectCommand, [this] { OnReportPrint(true); }, alwaysEnabled},
        {hostPrintPreviewCommand, preview, {}},
        {pageSetupCommand, [this] { OnPageSetup(); }, {}},
        {exitCommand, [this] { OnReportExit(); }, {}},
        {updateTextCommand, [this] { OnSaveReportText(); },
         [this](CommandState &state) { state.enabled = GetDocument() != nullptr && GetDocument()->HasTextObj(); }},
        {fileSaveCommand,
         [this] {
             if (GetDocument() != nullptr) {
                 GetDocument()->DoFileSave();
             }
         },
         alwaysEnabled},
        {fileSaveAsCommand,
         [this] {
             if (GetDocument() != nullptr) {
                 GetDocument()->DoSave(QString(), true);
             }
         },
         alwaysEnabled},
        editCommand(copyCommand, edit, &ReportEdit::copy, alwaysEnabled),
        editCommand(cutCommand, edit, &ReportEdit::cut, alwaysEnabled),
        {fileCloseCommand, [this] { closeReport(GetDocument()); }, closeState},
        {closeBoxCommand, {}, closeState},
        // Whether there is something to paste is not asked here: another program may take its time to answer.
        editCommand(pasteCommand, edit, &ReportEdit::paste, alwaysEnabled),
        editCommand(selectAllCommand, edit, &ReportEdit::selectAll),
        editCommand(undoCommand, edit, &ReportEdit::undo,
                    [&edit](CommandState &state) { state.enabled = edit.document()->isUndoAvailable(); }),
        editCommand(redoCommand, edit, &ReportEdit::redo,
                    [&edit](CommandState &state) { state.enabled = edit.document()->isRedoAvailable(); }),
        {findCommand, [widget] { widget->openFindBar(); }, {}},
        {findNextCommand, [widget] { widget->findNext(); }, {}},
        {findPreviousCommand, [widget] { widget->findPrevious(); }, {}},
        {goToPageCommand, [widget] { widget->openPageBar(); }, {}},
        {zoomInCommand, [&edit] { edit.zoomStep(1); }, {}},
        {zoomOutCommand, [&edit] { edit.zoomStep(-1); }, {}},
        {zoomResetCommand, [&edit] { edit.setZoomPercent(100); }, {}},
    };
}
