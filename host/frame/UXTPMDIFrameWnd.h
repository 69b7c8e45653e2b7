#pragma once

#include "CRibbonBar.h"
#include "CommandTarget.h"
#include "KaReportExport.h"

#include <QHash>
#include <QMainWindow>
#include <QPointer>

#include <vector>

namespace kareport
{
class PaneDock;
}

class COneViewPane;
class CViewPane;
class QMenu;
class UDocument;
class UView;

/// The main frame of the host: panes dock in it, and commands go from it to the active view and, when that has no handler,
/// to itself. There is at most one at a time.
///
/// Of the panes that dock in it one is the active one. It has the keyboard, and its view is the active view. A pane that
/// comes to the front, for whatever reason, becomes the active one at once; when it is closed, the one that was used
/// last before it and can be seen follows. A pane without a view, as a report window is, leaves the active view as it
/// is, but commands that it knows stay with it. No command reaches a view whose pane cannot be seen.
class KAREPORT_EXPORT UXTPMDIFrameWnd : public QMainWindow, public kareport::CommandTarget
{
public:
    /// Makes the frame, which `Get` answers from then on. It needs a `QApplication`.
    explicit UXTPMDIFrameWnd(QWidget *parent = nullptr);
    ~UXTPMDIFrameWnd() override;

    /// The frame, or null in a program without one.
    static UXTPMDIFrameWnd *Get();

    /// Which tab was in front for each view.
    CRibbonBar &GetRibbonBar() { return ribbonBar_; }

    /// The view that commands go to; null without one.
    UView *GetActiveView() const { return activeView_; }
    /// Makes a view the active one, and its pane the active pane: it comes to the front and gets the keyboard.
    void SetActiveViewForFrameAndPane(UView *view);
    /// The docking pane with the keyboard; null without one.
    COneViewPane *GetActivePane() const { return activePane_; }
    /// Makes a pane that is in front the active one, gives it the keyboard, and tells its view.
    void ActivatePane(COneViewPane &pane);
    /// The document that commands are for: what the active pane shows or, without one, the active view. Null for none.
    UDocument *GetCommandDocument() const;
    /// Takes the active view away when it is this one.
    void ResetActiveViewForFrameAndPane(UView *view);

    /// The action of a command, made with its first use: menus and bars that show a command show one action.
    QAction *CommandAction(unsigned id);
    /// Adds a command to a menu under a text such as "&Save\tCtrl+S": what follows the tab is its key.
    QAction *AddCommand(QMenu &menu, unsigned id, const QString &text);
    /// Runs a command wherever it is handled. @return false when nothing handles it
    bool OnCommand(unsigned id);
    /// Brings the state of all actions up to date.
    virtual void UpdateCommands();

    /// Docks a pane among the others: next to them as a tab, unless it has a place of its own.
    virtual void DockPane(COneViewPane &pane);
    /// Docks a pane that is no tab among the documents at a side of the frame: next to what is docked there.
    virtual void DockBar(COneViewPane &pane, Qt::DockWidgetArea area);

    const std::vector<kareport::Command> &commands() const override;

protected:
    /// Watches the layout of the docked panes.
    bool event(QEvent *event) override;
    /// Called when panes were shown, hidden, raised or closed: makes the one in front that was used last the active one,
    /// unless the active one is in front.
    virtual void SettlePanes();
    /// Whether a command that its handler enables has something to act on. A frame that wants to say more of its commands than
    /// the handlers do, overrides it: what it answers false for is disabled. Here always true.
    virtual bool CanAct(unsigned command) const;

private:
    friend class COneViewPane;
    friend class kareport::PaneDock;

    void LeavePane(const COneViewPane &pane);
    void ForgetPane(const COneViewPane &pane);
    void SettleLater();
    void TakePane(COneViewPane &pane);
    void FollowKeyboard(const QWidget *before, const QWidget *now);
    void WatchTabs();
    void TabClicked(int index);
    COneViewPane *PaneOf(const QWidget *widget) const;
    COneViewPane *PaneInFront(const QWidget *window = nullptr) const;
    kareport::CommandTarget *PaneTarget() const;
    kareport::CommandTarget *ViewTarget() const;

    CRibbonBar ribbonBar_;
    UView *activeView_ = nullptr;
    COneViewPane *activePane_ = nullptr;
    std::vector<COneViewPane *> usedPanes_; ///< the one that was used last at the end
    bool willSettle_ = false;
    QPointer<const QWidget> tabsOfNewWindow_; ///< that got the keyboard when their window became the active one
    QHash<unsigned, QAction *> actions_;
};
