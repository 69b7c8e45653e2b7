#pragma once

#include "SheetColumn.h"

#include <QCache>
#include <QPixmap>
#include <QTimer>

namespace kareport
{

/// The sheets of a report as small pictures with their numbers, to go to one of them.
class SheetThumbnails : public SheetColumn
{
public:
    explicit SheetThumbnails(Source source, QWidget *parent = nullptr);

    void sheetsChanged() override;
    /// Marks the sheet that is shown beside them and brings it into the window.
    void setShown(int sheet);
    int shown() const { return shown_; }
    /// Brings a sheet into the window.
    void bring(int sheet);
    /// Called with the sheet, from 0, that was chosen.
    void setGoHandler(std::function<void(int sheet)> handler) { go_ = std::move(handler); }

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    QSize sheetSize() const override;
    int gap() const override { return 8; }
    int captionHeight() const override { return fontMetrics().height() + 2; }
    void drawSheet(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect) override;

    void keyPressEvent(QKeyEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    const QPixmap *pictureOf(SheetLayout &layout, int sheet, const QSize &size);
    void choose(int sheet);

    QCache<int, QPixmap> pictures_;
    QTimer forgetTimer_; ///< the pictures are drawn again when the text has not changed for a while
    int shown_ = -1;
    std::function<void(int)> go_;
};

} // namespace kareport
