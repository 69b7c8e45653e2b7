#include "PrintSheets.h"

#include "LinePager.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The scale at which all pages of usual length, and the widest row of all, have room.
qreal usualScale(const std::vector<PageText> &texts, const std::vector<ReportPage> &pages, qint64 usualLines,
                 const SheetRoom &room)
{
    PageText usual;
    usual.rows = 1;
    for (std::size_t i = 0; i < texts.size(); ++i) {
        const PageText &text = texts[i];
        usual.points = text.points;
        usual.widestRow = std::max(usual.widestRow, text.widestRow);
        if (pages[i].lines <= usualLines) {
            usual.rowHeight = std::max(usual.rowHeight, static_cast<double>(text.rows) * text.rowHeight);
        }
    }
    return usual.points > 0 ? fitPage(usual, room).points / usual.points : 1;
}

void addSheets(std::vector<PrintSheet> &sheets, LinePager &pager, const QRect &twips, const ReportPage &page,
               qreal scale, bool inPieces)
{
    qint64 start = page.begin;
    while (inPieces) {
        const qint64 next = pager.layOutScaled(twips, start, page.end, scale);
        if (next <= start || next >= page.end) {
            break; // the last piece, or a sheet that takes nothing
        }
        sheets.push_back({start, next, scale});
        start = next;
    }
    sheets.push_back({start, page.end, scale});
}

} // namespace

std::vector<PrintSheet> printSheets(LinePager &pager, const QRect &twips, const std::vector<ReportPage> &pages,
                                    qint64 usualLines)
{
    const SheetRoom room = pager.room(twips);
    std::vector<PageText> texts;
    texts.reserve(pages.size());
    for (const ReportPage &page : pages) {
        texts.push_back(pager.measure(page.begin, page.end));
    }
    const qreal usual = usualScale(texts, pages, usualLines, room);
    std::vector<PrintSheet> sheets;
    sheets.reserve(pages.size());
    for (std::size_t i = 0; i < pages.size(); ++i) {
        const PageFit fit = fitPage(texts[i], room);
        const qreal own = texts[i].points > 0 ? fit.points / texts[i].points : 1;
        addSheets(sheets, pager, twips, pages[i], std::min(usual, own), fit.pieces > 1 || fit.breaksRows);
    }
    return sheets;
}

} // namespace kareport
