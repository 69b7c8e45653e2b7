#pragma once

#include "KaReportExport.h"

#include <QString>

class CViewPane;
class UView;

namespace kareport
{

/// What a report document needs of the separate window that mirrors its text. The window stays with its document also
/// while it is not on the screen: it is created, closed and created again.
class KAREPORT_EXPORT ReportWindow
{
public:
    virtual ~ReportWindow();
    /// Takes a piece of text as it is written; pieces are not whole lines. Nothing while the window is not created.
    virtual void WriteLine(const QString &piece) = 0;
    /// The pane that shows the window, closed together with the document; may be null.
    virtual CViewPane *GetOwningPane() = 0;

    /// Whether the window is there, shown or hidden.
    virtual bool isCreated() const = 0;
    /// Creates the window at the bottom of the main frame and shows it.
    /// @param caption       its title; may be empty
    /// @param previousView  the view that the user goes back to after the window; null for none
    /// @return false, with no window, when there is no main frame
    virtual bool createDocked(const QString &caption, UView *previousView) = 0;
    /// Shows the window or hides it, with its lines kept. Nothing while the window is not created.
    virtual void showBar(bool show) = 0;
    /// Whether the report in the window can be saved, printed and opened: not before it is written.
    virtual void setActive(bool active) = 0;
    /// Gives the keyboard to the window.
    virtual void takeFocus() = 0;
};

} // namespace kareport
