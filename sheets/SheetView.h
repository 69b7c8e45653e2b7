#pragma once

#include "PageRow.h"
#include "SheetColumn.h"
#include "TextSearch.h"

#include <map>
#include <optional>
#include <vector>

namespace kareport
{

/// The sheets of a report, to be read: zoomed, with the cursor, the selection and what is found of the report's text.
class SheetView : public SheetColumn
{
public:
    enum class Fit
    {
        Width, ///< the sheet is as wide as the window
        Page,  ///< a whole sheet is shown
        None   ///< as large as the zoom says
    };

    explicit SheetView(Source source, QWidget *parent = nullptr);

    void sheetsChanged() override;
    void setCurrent(int sheet) override;

    Fit fit() const { return fit_; }
    void setFit(Fit fit);
    /// Percent of the size on paper.
    int zoomPercent() const;
    /// @param percent  brought into 10 to 500
    void setZoomPercent(int percent);
    /// The next larger or smaller of the usual steps.
    void zoomStep(int direction);

    /// The sheet at the top of the window, from 0: the first of which a half is shown, or the last one there.
    int shownSheet() const;
    /// Brings the top of a sheet to that of the window.
    void goToSheet(int sheet);
    /// Marks the cursor, and what is selected from the anchor to it. @param follows  whether the place is brought into the window
    void setCursorPlace(qint64 anchor, qint64 position, bool follows);
    /// Marks all that a search finds; nothing where it is empty.
    void setSearch(const TextSearch &search);
    /// The text has been edited: where its characters are is asked for again.
    void forgetRows();
    /// Where the cursor is in the viewport; null where its sheet has not been found yet.
    QRectF cursorRect();
    /// The place in the text at a point of the viewport; -1 beside the sheets.
    qint64 positionAt(QPoint point);

    /// Called when a place was chosen with the mouse. @param extends  whether the selection ends there
    void setPlaceHandler(std::function<void(qint64 position, bool extends)> handler) { placed_ = std::move(handler); }
    /// Called for a double click, after the place was chosen: the word there is wanted.
    void setWordHandler(std::function<void()> handler) { wordWanted_ = std::move(handler); }
    /// Called when the zoom or the sheet that is shown has changed.
    void setShownHandler(std::function<void()> handler) { shown_ = std::move(handler); }
    void setFocusHandler(std::function<void()> handler) { focused_ = std::move(handler); }

protected:
    QSize sheetSize() const override;
    int gap() const override { return 12; }
    void drawSheet(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect) override;

    bool event(QEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void scrollContentsBy(int dx, int dy) override;

private:
    /// A place on a sheet that stays where it is in the window while the zoom changes.
    struct Held
    {
        QPoint point; ///< of the viewport
        int sheet = 0;
        double down = 0;  ///< from the sheet's top, in sheets
        int above = 0;    ///< pixels above its top: the space between sheets does not grow with them
        double right = 0; ///< from its left side, in sheets
    };

    Held hold(QPoint point) const;
    void keep(const std::optional<Held> &held);
    /// Notes what is at the top of the window now.
    void holdTop();
    void zoomAt(QPoint point, const std::function<void()> &change);
    double pixelsPerTwip() const;
    const std::vector<PageRow> &rowsOf(SheetLayout &layout, int sheet);
    void noteShown();
    QTransform toViewport(const SheetLayout &layout, int sheet) const;

    Fit fit_ = Fit::Width;
    int zoom_ = 100;
    int wheel_ = 0; ///< eighths of a degree turned since the last step
    qint64 anchor_ = 0;
    qint64 position_ = 0;
    bool follows_ = false; ///< whether the cursor is to be shown as soon as its sheet is known
    TextSearch search_;
    std::map<int, std::vector<PageRow>> rows_; ///< of the sheets whose places were asked for
    std::optional<Held> held_;                 ///< what is at the top of the window, also while there are no sheets
    bool isKeeping_ = false;                   ///< whether it is being brought back there
    int lastShown_ = -1;
    std::function<void(qint64, bool)> placed_;
    std::function<void()> wordWanted_;
    std::function<void()> shown_;
    std::function<void()> focused_;
};

} // namespace kareport
