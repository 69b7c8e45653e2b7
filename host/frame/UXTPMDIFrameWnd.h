#pragma once

#include "CRibbonBar.h"
#include "CommandTarget.h"
#include "KaReportExport.h"

#include <QHash>
#include <QMainWindow>

class COneViewPane;
class QMenu;
class UView;

/// The main frame of the host: panes dock in it, and commands go from it to the active view and, when that has no handler,
/// to itself. There is at most one at a time.
class KAREPORT_EXPORT UXTPMDIFrameWnd : public QMainWindow, public kareport::CommandTarget
{
public:
    explicit UXTPMDIFrameWnd(QWidget *parent = nullptr);
    ~UXTPMDIFrameWnd() override;

    /// The frame, or null in a program without one.
    static UXTPMDIFrameWnd *Get();

    CRibbonBar &GetRibbonBar() { return ribbonBar_; }

    /// The view that commands go to; null without one.
    UView *GetActiveView() const { return activeView_; }
    /// Makes a view the active one, and its pane the active pane.
    void SetActiveViewForFrameAndPane(UView *view);
    /// Takes the active view away when it is this one.
    void ResetActiveViewForFrameAndPane(UView *view);

    /// The action of a command, made with its first use: menus and bars that show a command show one action.
    QAction *CommandAction(unsigned id);
    /// Adds a command to a menu under a text such as "&Save\tCtrl+S": what stands behind the tab is its key.
    QAction *AddCommand(QMenu &menu, unsigned id, const QString &text);
    /// Runs a command wherever it is handled. @return false when nobody handles it
    bool OnCommand(unsigned id);
    /// Brings the state of all actions up to date.
    void UpdateCommands();

    /// Docks a pane among the others: beside them as a tab, unless it has a place of its own.
    virtual void DockPane(COneViewPane &pane);

    const std::vector<kareport::Command> &commands() const override;

protected:
    bool event(QEvent *event) override;

private:
    CRibbonBar ribbonBar_;
    UView *activeView_ = nullptr;
    QHash<unsigned, QAction *> actions_;
};
