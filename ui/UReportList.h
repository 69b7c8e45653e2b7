#pragma once

#include "KaReportExport.h"

#include <QListView>
#include <QTimer>

#include <memory>

namespace kareport
{
class LineWidth;
class ReportLines;
} // namespace kareport

/// The list of a report window: one row a line, all of one height, as wide as its widest line. A line is never cut or
/// abbreviated; what does not fit is reached with the horizontal scroll bar.
///
/// Lines may come by the hundred thousand while the list is not painted: they are shown together a moment after the
/// first of them, and each costs the same however many are there. A caller who asks the list before that moment gets
/// what holds with all lines in it.
class KAREPORT_EXPORT UReportList : public QListView
{
public:
    /// What a scroll bar asks for.
    enum ScrollCode : unsigned
    {
        lineBack = 0,      ///< one step up or left
        lineForward = 1,   ///< one step down or right
        thumbPosition = 4, ///< to where the thumb was released
        thumbTrack = 5     ///< to where the thumb is while it is dragged
    };

    /// A list without lines, which `Create` gives its place. @param parent  owns it; may be null
    explicit UReportList(QWidget *parent = nullptr);
    ~UReportList() override;

    /// Makes the list a child window with a sunken edge, in a small dialog font unless it has been given a font, and shows
    /// it. @param rect  its place in the parent
    /// @param id  the number by which the parent knows it
    /// @return false without a parent
    bool Create(QWidget *parent, const QRect &rect, int id);
    int GetDlgCtrlID() const { return id_; } ///< 0 before it is created

    // --- Rows -------------------------------------------------------------------------------------------------------

    /// Adds a line after the last and makes it the current one.
    void WriteLine(QStringView line);
    /// Adds a line after the last; the current one stays. The list becomes as wide as the line, if it is not.
    /// @return its row, or −1 when there is no memory
    int AddString(QStringView line);
    /// How many lines were added.
    int GetCount() const;
    /// A line as it was added; empty for a row that is not there.
    QString GetText(int row) const;
    /// The current row; −1 for none.
    int GetCurSel() const;
    /// Puts the current line on the clipboard, as it was added; nothing without one.
    void CopyLine() const;
    /// The width of the widest line so far, in pixels.
    int GetHorizontalExtent() const { return extent_; }

    // --- Place and scrolling ----------------------------------------------------------------------------------------

    /// Moves the list within its parent, sets its scroll bars by `UpdateScrollBarInfo` and draws it again; nothing before
    /// it is created.
    void Resize(int x, int y, int width, int height);
    /// What a rectangle and the list's inside have in common; empty when they do not meet.
    QRect ClipRect(const QRect &rect) const;
    /// Moves the content by what a scroll bar asks for, a pixel for a line, unless it would leave the list.
    /// @param code      a `ScrollCode`; every other is ignored
    /// @param position  for the thumb codes
    void OnHScroll(unsigned code, int position, QScrollBar *bar = nullptr);
    /// The same for the vertical scroll bar.
    void OnVScroll(unsigned code, int position, QScrollBar *bar = nullptr);
    /// Gives the scroll bars the range that the inside and the content cover together, and a page of the inside. They
    /// follow the lines again as soon as these are laid out.
    void UpdateScrollBarInfo();
    /// The content as `Create` stored it and `OnHScroll` and `OnVScroll` moved it.
    const QRect &GetContentRect() const { return contentRect_; }

    // --- View -------------------------------------------------------------------------------------------------------

    // As those of `QListView`, worked out from the one height that all rows have.

    /// Where the row of an index is, in coordinates of the viewport; an empty rectangle for an invalid index.
    QRect visualRect(const QModelIndex &index) const override;
    /// The row at a point of the viewport; an invalid index below the last one.
    QModelIndex indexAt(const QPoint &point) const override;
    /// Scrolls until the row of an index is seen.
    void scrollTo(const QModelIndex &index, ScrollHint hint = EnsureVisible) override;
    /// Lays the rows out again.
    void doItemsLayout() override;

protected:
    ///@{
    /// As those of `QListView`, worked out from the one height that all rows have.
    bool event(QEvent *event) override;
    void changeEvent(QEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void scrollContentsBy(int dx, int dy) override;
    void updateGeometries() override;
    QModelIndex moveCursor(CursorAction action, Qt::KeyboardModifiers modifiers) override;
    void setSelection(const QRect &rect, QItemSelectionModel::SelectionFlags command) override;
    QRegion visualRegionForSelection(const QItemSelection &selection) const override;
    int horizontalOffset() const override;
    int verticalOffset() const override;
    bool isIndexHidden(const QModelIndex &index) const override;
    ///@}

private:
    void flush();
    void measureAgain();
    void scrollContent(QScrollBar &bar, unsigned code, int position, QPoint direction);
    int contentWidth() const;
    int rowAt(int y) const; ///< may lie outside the rows
    QRect rowsRect(int first, int last) const;

    kareport::ReportLines *lines_;
    std::unique_ptr<kareport::LineWidth> lineWidth_;
    QTimer flushTimer_;
    int rowHeight_ = 1; ///< pixels
    int extent_ = 0;    ///< pixels
    int newest_ = -1;   ///< the row to make the current one with the next flush; −1 for none
    bool isCreated_ = false;
    int id_ = 0;
    QRect contentRect_;
};
