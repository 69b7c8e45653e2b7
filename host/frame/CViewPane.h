#pragma once

#include "KaReportExport.h"

#include <QRect>
#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

class UDocument;
class UView;

namespace kareport
{
class CommandTarget;
}

/// A pane of the host's frame that shows views. Open panes are known to the application by their captions.
class KAREPORT_EXPORT CViewPane
{
public:
    /// A pane without a view, which is not open yet.
    CViewPane();
    /// Destroys the views with the pane.
    virtual ~CViewPane();
    CViewPane(const CViewPane &) = delete;
    CViewPane &operator=(const CViewPane &) = delete;

    /// Takes a view into the pane, which owns it from then on. Without memory the view is destroyed.
    virtual void AddView(std::unique_ptr<UView> view);
    /// The views, in the order in which they were added.
    const std::vector<std::unique_ptr<UView>> &GetViews() const { return views_; }
    /// Takes a view out of the pane and destroys it.
    void RemoveView(UView *view);
    /// Where the pane is placed: window style and rectangle (null for the usual one). Called once, before it is shown.
    virtual void SetPlace(CViewPane *parent, unsigned style, const QRect *rect);
    /// The window style that `SetPlace` was given; 0 before.
    unsigned GetStyle() const { return style_; }
    /// The rectangle that `SetPlace` was given; nothing for the usual place.
    const std::optional<QRect> &GetRect() const { return rect_; }
    /// The view that was put into the pane last, which it shows; null for a pane without one.
    UView *GetActiveView() const { return views_.empty() ? nullptr : views_.back().get(); }
    /// The document of that view; null for a pane without one.
    UDocument *GetActiveDocument() const;
    /// What the pane shows: the document of its view, or for a pane without one what its body shows; null for nothing.
    virtual UDocument *GetShownDocument() const { return GetActiveDocument(); }
    /// Handles the frame's commands while the pane has the keyboard, before the active view does: a command that it knows
    /// is not passed on. Null leaves them all to the view.
    virtual kareport::CommandTarget *GetCommandTarget() { return nullptr; }

    /// The pane's title without its number.
    virtual void SetWindowTextW(const QString &text);
    /// The title as it was set, without a number.
    const QString &GetWindowTextW() const { return text_; }
    /// The text of the pane's caption: its title, with ":" and its number when it has one.
    QString GetCaption() const;
    /// Shows title and number again after one of them changed.
    virtual void UpdateTitle();

    /// The number of the pane among those that show the same document: from 1, 0 for an only pane and for one that is
    /// hidden, −1 while panes are being counted.
    int GetWindowNumber() const { return windowNumber_; }
    /// Gives the pane its number, which `UDocument::UpdateFrameCounts` does; it shows with the next `UpdateTitle`.
    void SetWindowNumber(int number) { windowNumber_ = number; }

    /// Whether the pane is open: shown, and not hidden since.
    virtual bool IsVisible() const { return visible_; }
    /// Whether the user sees the pane: it is visible, and no tab of another pane covers it.
    virtual bool IsInFront() const { return IsVisible(); }
    /// Shows the pane, or hides it with all that is in it.
    virtual void ShowPane(bool show);
    /// Brings the pane's window to the front.
    virtual void BringToTop();

    /// Whether the pane may be closed; asks its document.
    virtual bool CanClosePane();
    /// Closes the pane without asking: its views are destroyed, and the pane itself with them.
    virtual void ClosePane();

    /// Whether the caption is the title of a document. That of a pane with a body of its own is not.
    virtual bool HasDocumentTitle() const { return true; }

    /// Whether a pointer is a pane that is open.
    static bool IsOpen(const CViewPane *pane);
    /// The captions of all open panes that have a document's title, in the order in which they were opened.
    /// Throws std::bad_alloc without memory: a title would be taken for one that no other pane has.
    /// @param except  a document whose panes do not count; null for none
    static void GetPaneCaptions(QStringList &captions, const UDocument *except = nullptr);

protected:
    /// Numbers the panes of what is shown here again, after the pane was shown or hidden.
    void CountAgain();

private:
    bool Shows(const UDocument *document) const;

    std::vector<std::unique_ptr<UView>> views_;
    QString text_;
    unsigned style_ = 0;
    std::optional<QRect> rect_;
    int windowNumber_ = 0;
    bool visible_ = false;
};
