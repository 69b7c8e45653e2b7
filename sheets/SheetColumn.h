#pragma once

#include <QAbstractScrollArea>
#include <QColor>

#include <functional>
#include <utility>

namespace kareport
{

class SheetLayout;

/// A column of sheets of one size on a grey ground, one below the other. What is not on the screen costs nothing.
class SheetColumn : public QAbstractScrollArea
{
public:
    /// Answers the sheets as they are now; null while there are none to show.
    using Source = std::function<SheetLayout *()>;

    explicit SheetColumn(Source source, QWidget *parent = nullptr);

    /// Takes the sheets away: what they were asked from is about to be destroyed.
    void leave();
    /// The sheets are others, or more: brings scroll bars and window up to date.
    virtual void sheetsChanged();
    int count() const;
    /// Shown where there are no sheets.
    void setMessage(const QString &message);
    const QString &message() const { return message_; }

    /// The sheet, from 0, that is marked as the one with the cursor; -1 for none.
    int current() const { return current_; }
    virtual void setCurrent(int sheet);
    /// Where a sheet is in the viewport.
    QRect sheetRect(int sheet) const;
    /// The first and the last sheet that a part of the viewport shows; (0, -1) for none.
    std::pair<int, int> sheetsIn(const QRect &part) const;

protected:
    /// In pixels of the viewport.
    virtual QSize sheetSize() const = 0;
    virtual void drawSheet(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect) = 0;
    /// The space around each sheet, and below it for what is written there.
    virtual int gap() const = 0;
    virtual int captionHeight() const { return 0; }

    SheetLayout *layout() const { return source_ ? source_() : nullptr; }
    /// From the top of a sheet to that of the next one.
    int pitch() const { return sheetSize().height() + gap() + captionHeight(); }
    void setRanges();
    QColor ground() const;
    QColor frameOf(int sheet) const;
    /// Draws the text of a sheet into a rectangle.
    static void drawText(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect);

    void paintEvent(QPaintEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void scrollContentsBy(int dx, int dy) override;

private:
    Source source_;
    QString message_;
    int current_ = -1;
};

} // namespace kareport
