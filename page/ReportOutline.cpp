#include "ReportOutline.h"

#include "ReportPages.h"

#include <algorithm>

namespace kareport
{

namespace
{

bool isBefore(const OutlineEntry &entry, qint64 at)
{
    return entry.at < at;
}

/// Whether the line at a place of a removed text is removed to its end.
bool isLineRemoved(QStringView removed, qint64 at)
{
    return removed.indexOf(u'\n', at) >= 0;
}

} // namespace

void ReportOutline::clear()
{
    entries_.clear();
    placed_ = 0;
}

void ReportOutline::announce(int level, const QString &text)
{
    while (isWaiting() && entries_.back().level >= level) {
        entries_.pop_back();
    }
    entries_.push_back({level, text, 0});
}

void ReportOutline::place(qint64 at, QStringView text)
{
    const auto isSeen = [](QChar character) { return !isBlankLine(QStringView(&character, 1)); };
    const auto seen = std::find_if(text.begin(), text.end(), isSeen);
    if (seen == text.end()) {
        return;
    }
    for (; isWaiting(); ++placed_) {
        entries_[placed_].at = at + (seen - text.begin());
    }
}

bool ReportOutline::wantsRemoved(qint64 at, qint64 removed) const
{
    const auto placedEnd = entries_.begin() + static_cast<std::ptrdiff_t>(placed_);
    const auto first = std::lower_bound(entries_.begin(), placedEnd, at, isBefore);
    return removed > 0 && first != placedEnd && first->at < at + removed;
}

void ReportOutline::carry(qint64 at, qint64 removed, QStringView removedText, QStringView inserted) noexcept
{
    const auto placedEnd = entries_.begin() + static_cast<std::ptrdiff_t>(placed_);
    const auto first = std::lower_bound(entries_.begin(), placedEnd, at, isBefore);
    const auto after = std::lower_bound(first, placedEnd, at + removed, isBefore);
    // Lines that are put in before a line push it down; a word becomes part of it.
    const bool isPushed = inserted.endsWith(u'\n');
    const auto gone = std::remove_if(
        first, after, [&](const OutlineEntry &entry) { return isLineRemoved(removedText, entry.at - at); });
    for (auto entry = first; entry != gone; ++entry) {
        entry->at = at;
    }
    for (auto entry = after; entry != placedEnd; ++entry) {
        if (entry->at > at || isPushed || removed > 0) {
            entry->at += inserted.size() - removed;
        }
    }
    placed_ -= static_cast<std::size_t>(after - gone);
    entries_.erase(gone, after);
}

} // namespace kareport
