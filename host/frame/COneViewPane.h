#pragma once

#include "CViewPane.h"
#include "KaReportExport.h"

#include <QDockWidget>
#include <QPointer>

namespace kareport
{
class PaneDock;
}

/// A pane of the main frame that shows one view in a dock widget: docked, floating, or as a tab among others.
class KAREPORT_EXPORT COneViewPane : public CViewPane
{
public:
    /// The system command of a pane's close box.
    static constexpr unsigned scClose = 61536;

    /// How the caption is shown.
    enum CaptionState
    {
        captionPlain = 0,      ///< as the captions of other docked windows
        captionHighlighted = 2 ///< marked, so that it stands out among the others
    };

    COneViewPane();
    ~COneViewPane() override;

    /// Takes a view into the pane, which owns it, and shows its widget in place of the one before.
    void AddView(std::unique_ptr<UView> view) override;
    /// Docks the pane in the main frame, or leaves it a window of its own where there is none.
    void SetPlace(CViewPane *parent, unsigned style, const QRect *rect) override;
    /// Shows the caption in the title of the dock widget.
    void UpdateTitle() override;
    /// Whether the pane is open, also as a tab that another one hides.
    bool IsVisible() const override;
    /// Whether the pane is open and no other tab covers it.
    bool IsInFront() const override;
    /// Shows the pane and brings it to the front, or hides it.
    void ShowPane(bool show) override;
    /// Raises the pane, which becomes the active one of its frame and gets the keyboard; nothing while it is hidden.
    void BringToTop() override;

    /// A system command of the pane. Closing asks `CanClosePane`; other commands do nothing here.
    virtual void OnSysCommand(unsigned command, long parameter);

    /// Whether the pane may be one of the tabs of the documents.
    virtual bool CanBeTabbedDocument() const { return true; }
    /// Marks the caption or takes the mark away.
    void SetCaptionState(CaptionState state);
    /// What `SetCaptionState` was given last; plain without a dock widget.
    CaptionState GetCaptionState() const;

    /// The pane's dock widget; null once it has been destroyed with its frame.
    QDockWidget *GetDock() const;

protected:
    /// Makes the dock widget again if it no longer exists.
    void MakeDock();
    /// Takes the dock widget away, with all that is in it.
    void DropDock();

private:
    friend class kareport::PaneDock;

    void DockShown(bool shown);

    QPointer<kareport::PaneDock> dock_;
};
