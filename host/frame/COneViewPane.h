#pragma once

#include "CViewPane.h"
#include "KaReportExport.h"

#include <QDockWidget>
#include <QPointer>

/// A pane of the main frame that shows one view in a dock widget: docked, floating, or as a tab among others.
class KAREPORT_EXPORT COneViewPane : public CViewPane
{
public:
    /// The system command of a pane's close box.
    static constexpr unsigned scClose = 61536;

    COneViewPane();
    ~COneViewPane() override;

    void AddView(std::unique_ptr<UView> view) override;
    /// Docks the pane in the main frame, or lets it stand alone where there is none.
    void SetPlace(CViewPane *parent, unsigned style, const QRect *rect) override;
    void UpdateTitle() override;
    bool IsVisible() const override;
    void ShowPane(bool show) override;
    void BringToTop() override;

    /// A system command of the pane. Closing asks `CanClosePane`; other commands do nothing here.
    virtual void OnSysCommand(unsigned command, long parameter);

    QDockWidget *GetDock() const { return dock_; }

private:
    class Dock;

    QPointer<QDockWidget> dock_;
};
