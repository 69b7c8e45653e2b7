#include "PageRows.h"

#include <QPainter>
#include <QTextDocument>
#include <QTextLayout>

#include <algorithm>

namespace kareport
{

namespace
{

/// A line without end is laid out so many characters at a time, or each page of it would cost the whole line.
constexpr int pieceLength = 2000;
/// Wider, in dots, than such a piece.
constexpr qreal unbroken = 4e6;

} // namespace

void PageRows::prepare(QTextLayout &layout, int from, int stop) const
{
    QTextOption option(Qt::AlignLeft);
    option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    option.setTabStopDistance(text_.defaultTextOption().tabStopDistance()); // screen pixels, which the layout converts
    option.setTextDirection(line_.isRightToLeft() ? Qt::RightToLeft : Qt::LeftToRight);
    layout.setTextOption(option);
    layout.setCacheEnabled(true);
    QList<QTextLayout::FormatRange> formats;
    for (const Run &run : runs_) {
        const int first = std::max(from, run.from);
        const int last = std::min(stop, run.from + run.length);
        if (first < last) {
            QTextCharFormat format;
            format.setFont(run.face->font);
            format.setForeground(run.face->color);
            formats.push_back({first - from, last - first, format});
        }
    }
    layout.setFormats(formats);
}

int PageRows::endOfPiece(int from, int stop) const
{
    const int end = std::min(stop, from + pieceLength);
    return end < stop && line_[end].isLowSurrogate() ? end - 1 : end;
}

qreal PageRows::wholeWidth() const
{
    qreal widest = 0;
    qreal width = 0; // of the current row, which may take several pieces
    const auto stop = static_cast<int>(line_.size());
    for (int from = 0, end = 0; from < stop; from = end) {
        end = endOfPiece(from, stop);
        QTextLayout layout(line_.mid(from, end - from), runs_.front().face->font, &device_);
        prepare(layout, from, end);
        layout.beginLayout();
        for (QTextLine row = layout.createLine(); row.isValid(); row = layout.createLine()) {
            width = row.textStart() > 0 ? 0 : width;
            row.setLineWidth(unbroken);
            width += row.naturalTextWidth();
            widest = std::max(widest, width);
        }
        layout.endLayout();
    }
    return widest;
}

int PageRows::addWrapped(int from, int stop)
{
    while (from < stop) {
        const int pieceEnd = endOfPiece(from, stop);
        QTextLayout layout(line_.mid(from, pieceEnd - from), runs_.front().face->font, &device_);
        prepare(layout, from, pieceEnd);
        layout.beginLayout();
        const int pieceStart = from;
        for (QTextLine row = layout.createLine(); row.isValid(); row = layout.createLine()) {
            row.setLineWidth(area_.width);
            const int rowEnd = pieceStart + row.textStart() + row.textLength();
            if (rowEnd == pieceEnd && pieceEnd < stop && row.textStart() > 0) {
                break; // the row continues in the next piece
            }
            const Extents taken = extents(from, rowEnd);
            if (!reserve(taken.height)) {
                layout.endLayout();
                return from;
            }
            if (painter_ != nullptr) {
                used_ = nullptr;
                painter_->setPen(Qt::black);
                const qreal baseline = area_.top + y_ + taken.ascent;
                row.draw(painter_, QPointF(area_.left, baseline - row.ascent()) - row.position());
            }
            if (noted_ != nullptr) {
                PageRow place{
                    qint64(lineStart_) + from, qint64(lineStart_) + rowEnd, area_.top + y_, qreal(taken.height), {}};
                for (int at = from; at <= rowEnd; ++at) {
                    place.edges.push_back(area_.left + row.cursorToX(at - pieceStart) - row.x());
                }
                noted_->push_back(std::move(place));
            }
            y_ += taken.height;
            from = rowEnd;
        }
        layout.endLayout();
    }
    return stop;
}

} // namespace kareport
