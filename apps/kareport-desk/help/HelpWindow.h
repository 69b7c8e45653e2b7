#pragma once

#include "GuideBrowser.h"

#include <QDialog>

class QLabel;
class QLineEdit;
class QListWidget;
class QToolButton;

namespace kareport
{

/// The guides of the program in a window beside the work: a list of the pages, the page, a way back, and a text to look for.
class HelpWindow : public QDialog
{
public:
    explicit HelpWindow(QWidget *parent = nullptr);

    /// Shows a place such as "guide-desk.md#printing".
    void showPlace(const QString &place);
    /// Finds the next place of the text in the field. @return whether there is one on the page
    bool findNext(bool backward = false);

    GuideBrowser &browser() const { return *browser_; }
    QLineEdit &field() const { return *field_; }
    QListWidget &pages() const { return *pages_; }

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void noteSource(const QUrl &shown);
    void makePages();

    GuideBrowser *browser_;
    QListWidget *pages_;
    QLineEdit *field_;
    QLabel *found_;
    QToolButton *back_;
    QToolButton *forward_;
};

/// Shows a place of the guides in the help window of a window, which is made with its first use and goes with it.
void showGuide(QWidget &window, const QString &place);

/// Lets F1 show the place that fits, in every window of the program: also in dialogs, which keep keys from the main window.
class HelpKey : public QObject
{
public:
    /// @param frame  owns this object, and has a command of its own for the key
    explicit HelpKey(QWidget &frame);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QWidget &frame_;
};

} // namespace kareport
