#include "SheetMarks.h"

#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

qreal edgeOf(const PageRow &row, qint64 position)
{
    return row.edges.at(static_cast<std::size_t>(position - row.start));
}

} // namespace

std::vector<QRectF> rectsOf(const std::vector<PageRow> &rows, qint64 start, qint64 stop)
{
    std::vector<QRectF> rects;
    for (const PageRow &row : rows) {
        const qint64 first = std::max(start, row.start);
        const qint64 last = std::min(stop, row.stop);
        if (first < last) {
            const qreal left = edgeOf(row, first);
            const qreal right = edgeOf(row, last);
            rects.push_back(QRectF(left, row.top, right - left, row.height).normalized());
        }
    }
    return rects;
}

std::vector<QRectF> rectsOf(const std::vector<PageRow> &rows, const QTextDocument &text, const TextSearch &search)
{
    std::vector<QRectF> rects;
    if (search.isEmpty() || rows.empty()) {
        return rects;
    }
    for (QTextBlock block = text.findBlock(static_cast<int>(rows.front().start));
         block.isValid() && block.position() < rows.back().stop; block = block.next())
    {
        const QString line = block.text();
        for (qsizetype at = search.find(line); at >= 0; at = search.find(line, at + search.length())) {
            const auto found = rectsOf(rows, block.position() + at, block.position() + at + search.length());
            rects.insert(rects.end(), found.begin(), found.end());
        }
    }
    return rects;
}

QRectF cursorRect(const std::vector<PageRow> &rows, qint64 position)
{
    // At the end of a row that goes on, the cursor is at the beginning of the next one.
    for (auto row = rows.rbegin(); row != rows.rend(); ++row) {
        if (position >= row->start && position <= row->stop) {
            return {edgeOf(*row, position), row->top, 0, row->height};
        }
    }
    return {};
}

qint64 positionAt(const std::vector<PageRow> &rows, QPointF point)
{
    if (rows.empty()) {
        return -1;
    }
    const auto below = std::find_if(rows.begin(), rows.end(),
                                    [point](const PageRow &row) { return point.y() < row.top + row.height; });
    const PageRow &row = below != rows.end() ? *below : rows.back();
    const auto nearest = std::min_element(row.edges.begin(), row.edges.end(), [point](qreal a, qreal b) {
        return std::abs(a - point.x()) < std::abs(b - point.x());
    });
    return row.start + (nearest - row.edges.begin());
}

} // namespace kareport
