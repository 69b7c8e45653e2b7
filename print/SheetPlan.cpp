#include "SheetPlan.h"

#include "LinePager.h"

#include <algorithm>
#include <utility>

namespace kareport
{

SheetPlan::SheetPlan(LinePager &pager, const QRect &twips, qint64 usualLines)
    : pager_(pager), twips_(twips), usualLines_(usualLines)
{}

void SheetPlan::begin(std::vector<ReportPage> pages)
{
    begin(std::move(pages), UnchangedText());
}

void SheetPlan::begin(std::vector<ReportPage> pages, const UnchangedText &unchanged)
{
    const std::vector<ReportPage> pagesBefore = std::exchange(pages_, std::move(pages));
    const std::vector<PageText> textsBefore = std::exchange(texts_, std::vector<PageText>(pages_.size()));
    const std::vector<bool> wasMeasured = std::exchange(isMeasured_, std::vector<bool>(pages_.size()));
    const qint64 growth = unchanged.length - unchanged.lengthBefore;
    for (std::size_t i = 0; i < pages_.size(); ++i) {
        const ReportPage &page = pages_[i];
        const bool isBefore = page.end <= unchanged.head;
        if (!isBefore && page.begin < unchanged.length - unchanged.tail) {
            continue;
        }
        const qint64 moved = isBefore ? 0 : growth;
        const auto same = std::lower_bound(pagesBefore.begin(), pagesBefore.end(), page.begin - moved,
                                           [](const ReportPage &before, qint64 begin) { return before.begin < begin; });
        const auto index = static_cast<std::size_t>(same - pagesBefore.begin());
        if (same != pagesBefore.end() && same->begin == page.begin - moved && same->end == page.end - moved &&
            wasMeasured[index])
        {
            texts_[i] = textsBefore[index];
            isMeasured_[i] = true;
        }
    }
    measured_ = 0;
    placed_ = 0;
    sheets_.clear();
}

bool SheetPlan::step()
{
    while (measured_ < pages_.size() && isMeasured_[measured_]) {
        ++measured_;
    }
    if (measured_ < pages_.size()) {
        texts_[measured_] = pager_.measure(pages_[measured_].begin, pages_[measured_].end);
        isMeasured_[measured_] = true;
        ++measured_;
        return true;
    }
    if (placed_ == 0) {
        scale_ = usualScale();
        sheets_.reserve(pages_.size());
    }
    if (placed_ < pages_.size()) {
        addSheets(pages_[placed_], texts_[placed_]);
        ++placed_;
    }
    return placed_ < pages_.size();
}

int SheetPlan::percent() const
{
    return pages_.empty() ? 100 : static_cast<int>((measured_ + placed_) * 100 / (2 * pages_.size()));
}

/// The scale at which all pages of usual length, and the widest row of all, have room.
qreal SheetPlan::usualScale() const
{
    PageText usual;
    usual.rows = 1;
    for (std::size_t i = 0; i < texts_.size(); ++i) {
        const PageText &text = texts_[i];
        usual.points = text.points;
        usual.widestRow = std::max(usual.widestRow, text.widestRow);
        if (pages_[i].lines <= usualLines_) {
            usual.rowHeight = std::max(usual.rowHeight, static_cast<double>(text.rows) * text.rowHeight);
        }
    }
    return usual.points > 0 ? fitPage(usual, pager_.room(twips_)).points / usual.points : 1;
}

void SheetPlan::addSheets(const ReportPage &page, const PageText &text)
{
    const PageFit fit = fitPage(text, pager_.room(twips_));
    const qreal own = text.points > 0 ? fit.points / text.points : 1;
    const qreal scale = std::min(scale_, own);
    qint64 start = page.begin;
    while (fit.pieces > 1 || fit.breaksRows) {
        const qint64 next = pager_.layOutScaled(twips_, start, page.end, scale);
        if (next <= start || next >= page.end) {
            break; // the last piece, or a sheet that takes nothing
        }
        sheets_.push_back({start, next, scale});
        start = next;
    }
    sheets_.push_back({start, page.end, scale});
}

} // namespace kareport
