#include "ReportWindowCommands.h"

#include "ReportCommandIds.h"
#include "UReportDoc.h"
#include "UReportList.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

namespace kareport
{

ReportWindowCommands::ReportWindowCommands(UReportWindowDlg &window) : window_(window), commands_(makeCommands()) {}

bool ReportWindowCommands::hasReport() const
{
    return window_.IsActive() && window_.GetReportDoc() != nullptr;
}

UReportView *ReportWindowCommands::view() const
{
    return window_.GetReportDoc() != nullptr ? firstReportView(*window_.GetReportDoc()) : nullptr;
}

Command ReportWindowCommands::ofReport(unsigned id, void (ReportWindowCommands::*act)())
{
    return {id, [this, act] { (this->*act)(); }, [this](CommandState &state) { state.enabled = hasReport(); }};
}

Command ReportWindowCommands::ofView(unsigned id, void (*act)(UReportView &))
{
    return {id,
            [this, act] {
                if (UReportView *shown = view()) {
                    act(*shown);
                }
            },
            [this](CommandState &state) { state.enabled = hasReport() && view() != nullptr; }};
}

Command ReportWindowCommands::ofLoadedView(unsigned id, void (*act)(UReportView &))
{
    Command command = ofView(id, act);
    command.handler = [this, act] {
        if (UReportView *shown = view()) {
            shown->loadIfStale(); // it was hidden while the report was written
            act(*shown);
        }
    };
    return command;
}

void ReportWindowCommands::save()
{
    window_.GetReportDoc()->DoFileSave();
}

void ReportWindowCommands::saveAs()
{
    window_.GetReportDoc()->DoSave(QString(), true);
}

void ReportWindowCommands::close()
{
    UReportDoc *report = window_.GetReportDoc();
    if (report->SaveModified() && UReportDoc::IsReportAvailable(report)) {
        report->OnCloseDocument();
    }
}

void ReportWindowCommands::updateText()
{
    window_.GetReportDoc()->SaveText();
}

std::vector<Command> ReportWindowCommands::makeCommands()
{
    const auto print = [](UReportView &view) { view.OnReportPrint(); };
    const auto preview = [](UReportView &view) { view.OnReportPrintPreview(); };
    std::vector<Command> made = {
        ofReport(fileSaveCommand, &ReportWindowCommands::save),
        ofReport(fileSaveAsCommand, &ReportWindowCommands::saveAs),
        {fileCloseCommand, [this] { close(); },
         [this](CommandState &state) { state.enabled = hasReport() && window_.GetReportDoc()->EnableCloseOption(); }},
        {updateTextCommand, [this] { updateText(); },
         [this](CommandState &state) { state.enabled = hasReport() && window_.GetReportDoc()->HasTextObj(); }},
        ofLoadedView(filePrintCommand, print),
        ofLoadedView(hostPrintCommand, print),
        ofLoadedView(printDirectCommand, [](UReportView &view) { view.OnReportPrint(true); }),
        ofLoadedView(printPreviewCommand, preview),
        ofLoadedView(hostPrintPreviewCommand, preview),
        ofView(pageSetupCommand, [](UReportView &view) { view.OnPageSetup(); }),
        {copyCommand, [this] { window_.GetList()->CopyLine(); },
         [this](CommandState &state) {
             state.enabled = window_.GetList() != nullptr && window_.GetList()->GetCurSel() >= 0;
         }},
    };
    // The lines in the window are not edited, searched or shown in another size: that is what the report's view is for.
    for (const unsigned id :
         {cutCommand, pasteCommand, selectAllCommand, undoCommand, redoCommand, findCommand, findNextCommand,
          findPreviousCommand, goToPageCommand, zoomInCommand, zoomOutCommand, zoomResetCommand})
    {
        made.push_back({id, {}, [](CommandState &state) { state.enabled = false; }});
    }
    return made;
}

} // namespace kareport
