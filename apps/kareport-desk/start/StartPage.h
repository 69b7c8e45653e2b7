#pragma once

#include "EntryList.h"

#include <QWidget>

class QAction;
class QGridLayout;
class QLayout;

namespace kareport
{

/// What the main window shows while nothing is open: what a user begins with, the files used last, and the shipped examples.
/// It is used with the arrow keys and Enter, or with a click.
class StartPage : public QWidget
{
public:
    explicit StartPage(QWidget *parent = nullptr);

    /// Called with the path of a file that is chosen.
    std::function<void(const QString &path)> openFile;
    /// Sets the commands that it begins with. They must outlive it.
    void setCommands(const QList<QAction *> &commands);
    /// Looks at the files again.
    void refresh();
    /// Gives the keyboard to the list that is most useful.
    void takeKeyboard();

    EntryList &commandList() const { return *commands_; }
    EntryList &recentList() const { return *recent_; }
    EntryList &exampleList() const { return *examples_; }

protected:
    void showEvent(QShowEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    QLayout *makeHead();
    void addLists(QGridLayout &grid);
    void connectLists();

    QWidget *picture_;
    QList<QAction *> actions_;
    EntryList *commands_;
    EntryList *recent_;
    EntryList *examples_;
    QWidget *noRecent_;
};

} // namespace kareport
