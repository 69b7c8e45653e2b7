#include "DeskSheets.h"

#include "DeskCommandIds.h"
#include "Profile.h"
#include "ReportEdit.h"
#include "ReportMenu.h"
#include "SheetPane.h"
#include "SheetView.h"
#include "UApplication.h"
#include "UDocument.h"
#include "UXTPMDIFrameWnd.h"
#include "Xlate.h"

#include <QAction>
#include <QMenu>

namespace kareport
{

namespace
{

using Shows = SheetReportView::Shows;

const QString showsEntry = QStringLiteral("Report View");
const QString thumbnailsEntry = QStringLiteral("Thumbnails");
const QString pageLinesEntry = QStringLiteral("Page Lines");

QString textOf(Shows shows)
{
    switch (shows) {
    case Shows::Text: return QStringLiteral("text");
    case Shows::Sheets: return QStringLiteral("sheets");
    case Shows::Both: return QStringLiteral("both");
    }
    return QString();
}

SheetReportView *viewIn(const UXTPMDIFrameWnd &frame)
{
    return dynamic_cast<SheetReportView *>(frame.GetActiveView());
}

template <typename Work>
void forAllViews(Work work)
{
    for (UDocument *document : UApplication::Get()->GetDocuments()) {
        for (UView *view : document->GetViews()) {
            if (auto *shown = dynamic_cast<SheetReportView *>(view)) {
                work(*shown);
            }
        }
    }
}

/// Shows sheets in this way in the view in front, or the text alone where it already does.
void toggle(const UXTPMDIFrameWnd &frame, Shows shows)
{
    if (SheetReportView *view = viewIn(frame)) {
        view->setShows(view->shows() == shows ? Shows::Text : shows);
        SheetChoices choices = loadSheetChoices();
        choices.shows = view->shows();
        saveSheetChoices(choices);
    }
}

Command showCommand(unsigned id, UXTPMDIFrameWnd &frame, Shows shows)
{
    return {id, [&frame, shows] { toggle(frame, shows); },
            [&frame, shows](CommandState &state) {
                const SheetReportView *view = viewIn(frame);
                state.enabled = view != nullptr;
                state.checked = view != nullptr && view->shows() == shows;
            }};
}

Command fitCommand(unsigned id, UXTPMDIFrameWnd &frame, SheetView::Fit fit)
{
    return {id,
            [&frame, fit] {
                if (SheetReportView *view = viewIn(frame); view != nullptr && view->shows() != Shows::Text) {
                    view->sheets().pane().view().setFit(fit);
                }
            },
            [&frame](CommandState &state) {
                const SheetReportView *view = viewIn(frame);
                state.enabled = view != nullptr && view->shows() != Shows::Text;
            }};
}

} // namespace

SheetChoices loadSheetChoices()
{
    SheetChoices choices;
    const QString shows = GetProfileString(QString(), showsEntry);
    for (const Shows known : {Shows::Sheets, Shows::Both}) {
        choices.shows = shows == textOf(known) ? known : choices.shows;
    }
    choices.thumbnails = GetProfileString(QString(), thumbnailsEntry) != u"0";
    choices.pageLines = GetProfileString(QString(), pageLinesEntry) == u"1";
    return choices;
}

void saveSheetChoices(const SheetChoices &choices)
{
    const auto flag = [](bool on) { return on ? QStringLiteral("1") : QStringLiteral("0"); };
    WriteProfileString(QString(), showsEntry, textOf(choices.shows));
    WriteProfileString(QString(), thumbnailsEntry, flag(choices.thumbnails));
    WriteProfileString(QString(), pageLinesEntry, flag(choices.pageLines));
}

void showAsChosen(SheetReportView &view)
{
    const SheetChoices choices = loadSheetChoices();
    view.setShowsThumbnails(choices.thumbnails);
    view.setShowsPageLines(choices.pageLines);
    view.setShows(choices.shows);
}

std::vector<Command> sheetCommands(UXTPMDIFrameWnd &frame)
{
    const auto change = [](const auto &set) {
        SheetChoices choices = loadSheetChoices();
        set(choices);
        saveSheetChoices(choices);
        forAllViews([&choices](SheetReportView &view) {
            view.setShowsThumbnails(choices.thumbnails);
            view.setShowsPageLines(choices.pageLines);
        });
    };
    return {
        showCommand(viewSheetsCommand, frame, Shows::Sheets),
        showCommand(viewSheetsBesideCommand, frame, Shows::Both),
        {viewThumbnailsCommand,
         [change] { change([](SheetChoices &choices) { choices.thumbnails = !choices.thumbnails; }); },
         [](CommandState &state) { state.checked = loadSheetChoices().thumbnails; }},
        {viewPageLinesCommand,
         [change] { change([](SheetChoices &choices) { choices.pageLines = !choices.pageLines; }); },
         [](CommandState &state) { state.checked = loadSheetChoices().pageLines; }},
        fitCommand(fitWidthCommand, frame, SheetView::Fit::Width),
        fitCommand(fitPageCommand, frame, SheetView::Fit::Page),
        {printSelectionCommand,
         [&frame] {
             if (SheetReportView *view = viewIn(frame)) {
                 view->OnPrintSelection();
             }
         },
         [&frame](CommandState &state) {
             SheetReportView *view = viewIn(frame);
             state.enabled =
                 view != nullptr && view->GetWidget() != nullptr && view->GetEdit().textCursor().hasSelection();
         }},
    };
}

void addSheetMenu(UXTPMDIFrameWnd &frame, const ReportMenu &menu)
{
    menu.file->insertAction(frame.CommandAction(printPreviewCommand),
                            frame.AddCommand(*menu.file, printSelectionCommand, Xlate("Print Se&lection...")));
    menu.view->addSeparator();
    frame.AddCommand(*menu.view, viewSheetsCommand, Xlate("S&heets\tF8"))->setCheckable(true);
    frame.AddCommand(*menu.view, viewSheetsBesideCommand, Xlate("Sheets &Beside the Text\tShift+F8"))
        ->setCheckable(true);
    frame.AddCommand(*menu.view, viewThumbnailsCommand, Xlate("Small &Pictures of the Sheets"))->setCheckable(true);
    frame.AddCommand(*menu.view, viewPageLinesCommand, Xlate("Page &Lines in the Text"))->setCheckable(true);
    menu.view->addSeparator();
    frame.AddCommand(*menu.view, fitWidthCommand, Xlate("Fit to &Width"));
    frame.AddCommand(*menu.view, fitPageCommand, Xlate("Fit to Pa&ge"));
}

void restartAllSheets()
{
    forAllViews([](SheetReportView &view) { view.restartSheets(); });
}

} // namespace kareport
