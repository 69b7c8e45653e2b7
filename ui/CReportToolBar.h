#pragma once

#include "CommandTarget.h"

#include <QToolBar>

class UXTPMDIFrameWnd;

/// The bar of the report window: Save, View\Edit Report and Print. Its buttons follow the window that owns it, not the main
/// frame.
class CReportToolBar : public QToolBar
{
public:
    enum DockingMode
    {
        DockImmediately = 1
    };

    /// @param owner  handles the bar's commands; it must outlive the bar. Null leaves that to the bar's
    /// parent, where it handles commands
    explicit CReportToolBar(kareport::CommandTarget *owner, QWidget *parent = nullptr);

    /// The number of the bar, by which its window knows it.
    int GetDlgCtrlID() const;

    /// The bar docks at once, without markers of the places where it could.
    DockingMode GetDockingMode() const { return DockImmediately; }
    /// No menu of bars is shown. @return false
    bool OnShowControlBarMenu(const QPoint &point) const;
    /// Brings the buttons up to date by the owner. The arguments are those of bars that ask the frame; they are not looked at.
    void OnUpdateCmdUI(UXTPMDIFrameWnd *frame, bool disableIfNoHandler);
    /// Gives the tool tip of a button, which is asked for when the bar is shown and when the language changes. @return
    /// false leaves the button the one that it has; here true
    virtual bool OnUserToolTip(const QAction *button, QString &text) const;

protected:
    void changeEvent(QEvent *event) override;
    void contextMenuEvent(QContextMenuEvent *event) override;
    void showEvent(QShowEvent *event) override;

private:
    kareport::CommandTarget *target() const;

    void addButton(unsigned id);
    void showTips();

    kareport::CommandTarget *owner_;
};
