#include "DeskRuns.h"

#include "COneViewPane.h"
#include "DeskCommandIds.h"
#include "FilePlace.h"
#include "NotesPane.h"
#include "ReportEdit.h"
#include "ReportMenu.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UXTPMDIFrameWnd.h"
#include "UnitsBar.h"
#include "Xlate.h"

#include <QMenu>
#include <QStatusBar>
#include <QToolButton>

#include <iterator>

namespace kareport
{

std::vector<Command> DeskRuns::commands()
{
    const auto isMade = [this](CommandState &state) { state.enabled = recipeInFront() != nullptr; };
    return {
        {runAgainCommand, [this] { runAgain(); }, isMade},
        {runWhenChangedCommand, [this] { setFollowsFiles(!followsFiles()); },
         [this](CommandState &state) { state.checked = followsFiles(); }},
        {saveAsJobCommand, [this] { saveAsJob(); }, isMade},
        {viewUnitsBarCommand, [this] { units_->setVisible(!units_->isVisible()); },
         [this](CommandState &state) { state.checked = units_->isVisible(); }},
        {chooseUnitsCommand, [this] { units_->takeFocus(); }, isMade},
        {viewNotesCommand, [this] { notesPane().setVisible(!notesPane().isVisible()); },
         [this](CommandState &state) { state.checked = !notes_.isNull() && notes_->isVisible(); }},
        {goToNotesCommand, [this] { notesPane().open(); }, {}},
    };
}

void DeskRuns::addTo(const ReportMenu &menu)
{
    const auto insert = [this](QMenu &into, unsigned before, unsigned id, const QString &text) {
        QAction *added = frame_.AddCommand(into, id, text);
        into.insertAction(frame_.CommandAction(before), added);
        return added;
    };
    insert(*menu.file, updateTextCommand, saveAsJobCommand, Xlate("Save as &Job..."));
    insert(*menu.file, updateTextCommand, runAgainCommand, Xlate("&Run Again\tF5"));
    insert(*menu.file, updateTextCommand, runWhenChangedCommand, Xlate("Run W&hen Files Change"))->setCheckable(true);
    units_ = new UnitsBar(&frame_);
    units_->setChosenHandler([this](const QJsonObject &changed) {
        if (UReportDoc *report = inFront()) {
            runWith(*report, changed);
        }
    });
    frame_.addToolBarBreak();
    frame_.addToolBar(units_);
    frame_.AddCommand(*menu.view, viewUnitsBarCommand, Xlate("U&nits Bar"))->setCheckable(true);
    frame_.AddCommand(*menu.view, chooseUnitsCommand, Xlate("&Choose Units\tCtrl+U"));
    frame_.AddCommand(*menu.view, viewNotesCommand, Xlate("N&otes"))->setCheckable(true);
    frame_.AddCommand(*menu.view, goToNotesCommand, Xlate("&Go to Notes\tF4"));
}

NotesPane &DeskRuns::notesPane()
{
    if (notes_.isNull()) {
        notes_ = new NotesPane(&frame_);
        notes_->setLeaveHandler([this] {
            if (UView *view = frame_.GetActiveView()) {
                view->OnActivateView(true, view, view);
            } else if (COneViewPane *pane = frame_.GetActivePane()) {
                frame_.ActivatePane(*pane);
            }
        });
        notes_->setGoHandler([this](int number, bool isInFile) { goToNote(number, isInFile); });
        // At the top are the reports: as a tab among them it would hide the one that has the keyboard.
        notes_->setAllowedAreas(Qt::LeftDockWidgetArea | Qt::RightDockWidgetArea | Qt::BottomDockWidgetArea);
        frame_.addDockWidget(Qt::BottomDockWidgetArea, notes_);
        notes_->hide();
        showNotes();
    }
    return *notes_;
}

void DeskRuns::showFront()
{
    UReportDoc *report = inFront();
    const Made *made = madeOf(report);
    const UDocument *front = made != nullptr ? report : nullptr;
    if (front == shown_ && state_ == shownState_) {
        return;
    }
    shown_ = front;
    shownState_ = state_;
    units_->showSettings(made != nullptr ? std::optional(report->GetJobSettings()) : std::nullopt);
    showNotes();
    showCount();
}

void DeskRuns::showNotes()
{
    const Made *made = madeOf(shown_);
    if (!notes_.isNull()) {
        notes_->showNotes(made != nullptr ? made->notes.said() : std::vector<JobNote>(),
                          made != nullptr ? made->problem : QString());
    }
}

void DeskRuns::showCount()
{
    const Made *made = madeOf(shown_);
    const qsizetype count =
        made != nullptr ? std::ssize(made->notes.said()) + (made->problem.isEmpty() ? 0 : 1) : qsizetype(0);
    count_->setVisible(count > 0);
    count_->setText(count == 1 ? Xlate("1 note") : Xlate("%1 notes").arg(count));
    count_->setToolTip(Xlate("Shows the notes on the report"));
}

/// Goes to what a note is about. @param isInFile  to its place in a file also where it has a line of the report
void DeskRuns::goToNote(int number, bool isInFile)
{
    UReportDoc *report = inFront();
    const Made *made = madeOf(report);
    const std::vector<JobNote> notes = made != nullptr ? made->notes.said() : std::vector<JobNote>();
    if (number < 0 || number >= static_cast<int>(notes.size())) {
        return;
    }
    const JobNote &note = notes[static_cast<std::size_t>(number)];
    if (note.line > 0 && !isInFile) {
        goToLine(*report, note.line);
        return;
    }
    const bool isInData = note.dataPlace.has_value();
    const QString file = isInData ? note.dataFile : note.about.file;
    const auto place = isInData ? note.dataPlace : note.about.place;
    if (file.isEmpty() || !showFilePlace(&frame_, file, place.value_or(TextPlace()))) {
        frame_.statusBar()->showMessage(Xlate("There is no file with a place for this note."));
    }
}

/// @param line  of the report, from 1
void DeskRuns::goToLine(UReportDoc &report, qint64 line)
{
    auto *window = dynamic_cast<UReportWindowDlg *>(report.GetReportWindow());
    if (window != nullptr && window->isCreated()) {
        window->ShowReport(); // whose list has pieces of lines
    }
    if (!UReportDoc::IsReportAvailable(&report)) {
        return;
    }
    for (UView *view : report.GetViews()) {
        auto *reportView = dynamic_cast<UReportView *>(view);
        if (reportView != nullptr && view->IsVisible()) {
            frame_.SetActiveViewForFrameAndPane(view);
            reportView->GetEdit().goToLine(static_cast<int>(line) - 1);
            reportView->GetEdit().setFocus(Qt::OtherFocusReason);
            return;
        }
    }
}

} // namespace kareport
