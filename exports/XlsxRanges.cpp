#include "XlsxRanges.h"

#include "ResultSink.h"

#include <algorithm>

namespace kareport
{

void XlsxRanges::beginTable(std::size_t columns)
{
    *this = XlsxRanges();
    values_.resize(columns);
}

void XlsxRanges::beginSheet()
{
    first_ = noRow;
    std::fill(begins_.begin(), begins_.end(), noRow);
    lastBegin_ = noRow;
    std::fill(values_.begin(), values_.end(), Values());
}

void XlsxRanges::addRow(lxw_row_t row, int level)
{
    if (!hasRows_) {
        first_ = row;
        hasRows_ = true;
    }
    last_ = row;
    if (level != ResultRow::noLevel) {
        begins_.resize(static_cast<std::size_t>(level), lastBegin_);
        lastBegin_ = row;
    }
    for (Values &values : values_) {
        values.beforeData = values.latest;
    }
}

std::optional<XlsxRanges::Range> XlsxRanges::of(int level, std::size_t column) const
{
    const auto at = static_cast<std::size_t>(level);
    const lxw_row_t first = level == ResultRow::noLevel ? first_ : at < begins_.size() ? begins_[at] : lastBegin_;
    if (first == noRow || values_[column].beforeData > first) {
        return std::nullopt;
    }
    return Range{first, last_};
}

} // namespace kareport
