#pragma once

#include <QDockWidget>

class COneViewPane;

namespace kareport
{

/// The dock widget of a pane: its close box asks the pane, its caption can be marked, and where the pane must not become a
/// tab it leaves every row of tabs that it gets into.
class PaneDock : public QDockWidget
{
public:
    explicit PaneDock(COneViewPane *pane);

    /// The pane; null once it has been destroyed.
    COneViewPane *pane() const { return pane_; }
    void leavePane() { pane_ = nullptr; }

    void setCaption(const QString &caption);
    /// Shows the caption highlighted: by its colour, and where the window system draws it, by a dot before the text.
    void setMarked(bool marked);
    bool isMarked() const { return marked_; }
    /// Shows that there are changes that are not saved: by a star after the caption, on the tab as well.
    void setUnsaved(bool unsaved);

    /// Whether the dock widget is in a row of tabs that the pane is not in.
    bool isTabbedAgainstItsWill() const;
    /// Leaves such a row for a place of its own in the same area.
    void standAlone();
    /// Whether the tab of another dock widget covers it.
    bool isBehindTab() const;
    /// Comes before the other tabs of its row and, where it floats, before other windows.
    void comeToFront();

    void setVisible(bool visible) override;

protected:
    bool event(QEvent *event) override;
    void closeEvent(QCloseEvent *event) override;
    void paintEvent(QPaintEvent *event) override;

private:
    void showCaption();
    void activatePane();
    /// Lets the frame choose the active pane again when the pane came to the front or left it.
    void noteFront();

    COneViewPane *pane_;
    QString caption_;
    bool marked_ = false;
    bool unsaved_ = false;
    bool wasInFront_ = false;
};

} // namespace kareport
