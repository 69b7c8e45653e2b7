#pragma once

#include "PageFit.h"
#include "PageRow.h"
#include "PrintFaces.h"

#include <QRect>
#include <QtGlobal>

#include <vector>

class QPaintDevice;
class QPainter;
class QTextDocument;

namespace kareport
{

struct PageArea;

/// Lays the lines of a text out in pages and draws them: the one rule for where a page ends, whether pages are counted,
/// shown or printed.
///
/// A line that is wider than the page continues in the next row. A page takes one row at least, however high it is.
///
/// Faces are made once: a pager serves one job, in which the text stays as it is.
class LinePager
{
public:
    /// Text and device must outlive the pager.
    LinePager(const QTextDocument &text, QPaintDevice &device);

    const QTextDocument &text() const { return text_; }
    const QPaintDevice &device() const { return device_; }

    /// The lines that the pages of the text were written for. Where a page measured in twips has them except for rounding,
    /// or one more by a rounding, it takes just as many.
    void setUsualLines(int lines) { usualLines_ = lines; }

    /// The characters of the text; the one after the last line's end does not count.
    qint64 length() const;

    /// Lays out the characters from `start` to `stop` (-1: to the end) as far as they fit a rectangle in twips.
    /// @param painter  draws them where it is not null; it must paint on the pager's device, or in its dots
    /// @param places   receives where each row is on the sheet; may be null
    /// @return the first character that did not fit; `start` where the rectangle is empty
    qint64 layOut(const QRect &twips, qint64 start, qint64 stop, QPainter *painter = nullptr,
                  std::vector<PageRow> *places = nullptr);
    /// The same in type of another size: `scale` times its own. The usual lines do not count.
    qint64 layOutScaled(const QRect &twips, qint64 start, qint64 stop, qreal scale, QPainter *painter = nullptr,
                        std::vector<PageRow> *places = nullptr);

    /// The lines from `start` to `stop` as one page at their own size, none of them broken; lengths in dots.
    PageText measure(qint64 start, qint64 stop);
    /// What a rectangle gives to text, in dots.
    SheetRoom room(const QRect &twips) const;

private:
    qint64 layOutIn(const PageArea &area, qint64 start, qint64 end, QPainter *painter, std::vector<PageRow> *places);

    const QTextDocument &text_;
    QPaintDevice &device_;
    PrintFaces faces_;
    int usualLines_ = 0;
};

} // namespace kareport
