#pragma once

#include "JobNotes.h"

#include <QDockWidget>
#include <QString>

#include <functional>
#include <utility>
#include <vector>

class QPushButton;
class QTreeWidget;

namespace kareport
{

/// A pane with the notes on a report: kind, text, line of the report and place of each.
class NotesPane : public QDockWidget
{
public:
    explicit NotesPane(QWidget *parent);

    /// @param problem  why the report could not be made again, which comes first; empty where it could
    void showNotes(const std::vector<JobNote> &notes, const QString &problem);
    /// How many notes are shown, with the problem.
    int count() const;
    /// Called when the user goes to a note. @param number  from 0, of those that were shown; −1 for the problem
    /// @param isInFile  to its place in a file, and not to the line of the report
    void setGoHandler(std::function<void(int number, bool isInFile)> handler) { go_ = std::move(handler); }
    /// Called when the keyboard is to go back to the report: with Escape, and when the pane that has it is hidden.
    void setLeaveHandler(std::function<void()> handler) { leave_ = std::move(handler); }
    /// Shows the pane and gives it the keyboard.
    void open();
    void setVisible(bool visible) override;

    QTreeWidget &list() const { return *list_; }

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    void goTo(bool isInFile);
    void enableButtons();

    QTreeWidget *list_;
    QPushButton *line_;
    QPushButton *file_;
    std::function<void(int, bool)> go_;
    std::function<void()> leave_;
};

/// What a kind of notes is called.
QString noteKindText(JobNote::Kind kind);

} // namespace kareport
