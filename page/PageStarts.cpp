#include "PageStarts.h"

#include "PageHeader.h"

#include <QHash>

#include <algorithm>
#include <iterator>
#include <utility>

namespace kareport
{

namespace
{

constexpr std::size_t mostRecords = 256;
constexpr std::size_t otherSeed = 0x9E3779B9;

/// What an edit changes, without what is the same at both ends of the removed and of the inserted text: controls report
/// more than has changed.
struct Difference
{
    qint64 at;
    QStringView removed;
    QStringView inserted;
};

Difference differenceOf(qint64 at, QStringView removed, QStringView inserted)
{
    const auto front = std::mismatch(removed.begin(), removed.end(), inserted.begin(), inserted.end());
    const qsizetype before = front.first - removed.begin();
    removed = removed.sliced(before);
    inserted = inserted.sliced(before);
    const auto back =
        std::mismatch(std::make_reverse_iterator(removed.end()), std::make_reverse_iterator(removed.begin()),
                      std::make_reverse_iterator(inserted.end()), std::make_reverse_iterator(inserted.begin()));
    const qsizetype after = back.first - std::make_reverse_iterator(removed.end());
    return {at + before, removed.chopped(after), inserted.chopped(after)};
}

void sortOut(std::vector<qint64> &positions)
{
    std::sort(positions.begin(), positions.end());
    positions.erase(std::unique(positions.begin(), positions.end()), positions.end());
}

} // namespace

PageStarts::Piece PageStarts::Piece::of(QStringView text)
{
    return {text.size(), qHash(text), qHash(text, otherSeed)};
}

bool PageStarts::Record::bringsPages() const
{
    // A line end alone, or a character, is typed anywhere.
    return inserted.length == 0 &&
           (removed.length > 2 || std::any_of(before.begin(), before.end(),
                                              [this](qint64 offset) { return offset > 0 && offset < removed.length; }));
}

const PageStarts::Record *PageStarts::inverseOf(const Record &edit) const
{
    const auto isInverse = [&edit](const Record &record) {
        return record.at == edit.at && record.inserted == edit.removed && record.removed == edit.inserted &&
               record.after == edit.before;
    };
    const auto found = std::find_if(records_.rbegin(), records_.rend(), isInverse);
    return found == records_.rend() ? nullptr : &*found;
}

std::vector<qint64> PageStarts::broughtBy(const Record &edit) const
{
    std::vector<qint64> brought;
    const auto found = std::find_if(records_.rbegin(), records_.rend(), [&edit](const Record &record) {
        return record.removed == edit.inserted && record.bringsPages();
    });
    if (found != records_.rend()) {
        std::copy_if(found->before.begin(), found->before.end(), std::back_inserter(brought),
                     [&found](qint64 offset) { return offset < found->removed.length; });
    }
    return brought;
}

void PageStarts::clear()
{
    positions_.clear();
    records_.clear();
}

void PageStarts::assign(std::vector<qint64> positions)
{
    positions.erase(std::remove_if(positions.begin(), positions.end(), [](qint64 at) { return at < 0; }),
                    positions.end());
    sortOut(positions);
    positions_ = std::move(positions);
    records_.clear();
}

void PageStarts::add(qint64 at)
{
    if (positions_.empty() || positions_.back() < at) {
        positions_.push_back(at);
    }
}

bool PageStarts::wantsRemoved(qint64 at, qint64 removed, qint64 inserted) const
{
    if (removed == 0) {
        return false;
    }
    const auto first = std::lower_bound(positions_.begin(), positions_.end(), at);
    return inserted > 0 || removed > shortestHeader || (first != positions_.end() && *first <= at + removed);
}

PageStarts::Edit PageStarts::prepare(qint64 at, qint64 removed, QStringView removedText, QStringView inserted,
                                     bool beginsLine)
{
    const bool isSeen = !removedText.isEmpty();
    const Difference changed = isSeen ? differenceOf(at, removedText, inserted) : Difference{at, {}, inserted};
    const auto first = std::lower_bound(positions_.begin(), positions_.end(), at);
    const auto last = std::upper_bound(first, positions_.end(), at + removed);
    Edit edit;
    edit.first = static_cast<std::size_t>(first - positions_.begin());
    edit.last = static_cast<std::size_t>(last - positions_.begin());
    edit.at = changed.at;
    edit.removed = isSeen ? changed.removed.size() : removed;
    edit.growth = inserted.size() - removed;

    // Starts next to what differs keep their places in the text.
    const qint64 end = edit.at + edit.removed;
    Record record;
    record.at = edit.at;
    for (auto start = first; start != last; ++start) {
        if (*start >= edit.at && *start <= end) {
            record.before.push_back(*start - edit.at);
        } else {
            edit.middle.push_back(*start < edit.at ? *start : *start + edit.growth);
        }
    }
    std::vector<qint64> headers = pageHeadersIn(inserted);
    if (!beginsLine && !headers.empty() && headers.front() == 0) {
        headers.erase(headers.begin()); // the end of one
    }
    // The line of a page header may begin no page: it stays so when its removal is undone.
    const bool removesHeaders = !pageHeadersIn(changed.removed).empty();
    if (!records_.empty() || !record.before.empty() || !headers.empty() || removesHeaders) {
        record.removed = Piece::of(changed.removed);
        record.inserted = Piece::of(changed.inserted);
    }
    if (const Record *undone = inverseOf(record)) {
        edit.undone = static_cast<std::size_t>(undone - records_.data());
        record.after = undone->before;
    } else {
        record.after = broughtBy(record);
        for (const qint64 header : headers) {
            const qint64 offset = at + header - edit.at;
            offset >= 0 && offset < changed.inserted.size() ? record.after.push_back(offset)
                                                            : edit.middle.push_back(at + header);
        }
        carry(record, edit.removed, changed.inserted);
    }
    for (const qint64 offset : record.after) {
        edit.middle.push_back(edit.at + offset);
    }
    sortOut(edit.middle);

    if (!record.before.empty() || !record.after.empty() || removesHeaders) {
        edit.record = std::move(record);
        records_.reserve(mostRecords + 1);
    }
    positions_.reserve(positions_.size() + edit.middle.size());
    return edit;
}

void PageStarts::carry(Record &record, qint64 removed, QStringView inserted)
{
    const bool isFirstBrought = std::find(record.after.begin(), record.after.end(), 0) != record.after.end();
    const bool isBefore = isFirstBrought || (record.at > 0 && inserted.endsWith(u'\n'));
    for (const qint64 offset : record.before) {
        if (removed == 0) {
            record.after.push_back(isBefore ? inserted.size() : 0);
        } else if (offset == 0) {
            record.after.push_back(0);
        } else if (offset == removed) {
            record.after.push_back(inserted.size());
        }
    }
    sortOut(record.after);
}

void PageStarts::carryOut(Edit &&edit) noexcept
{
    const auto begin = positions_.begin() + static_cast<std::ptrdiff_t>(edit.first);
    const auto next = positions_.erase(begin, positions_.begin() + static_cast<std::ptrdiff_t>(edit.last));
    for (auto start = next; start != positions_.end(); ++start) {
        *start += edit.growth;
    }
    positions_.insert(next, edit.middle.begin(), edit.middle.end());

    // The places of earlier edits move as well. Those at the place of an inverse are where they were before its edit.
    const qint64 end = edit.at + edit.removed;
    for (Record &record : records_) {
        if (record.at > end || (record.at == end && (edit.removed > 0 || !edit.undone))) {
            record.at += edit.growth;
        } else if (record.at > edit.at) {
            record.at = edit.at;
        }
    }
    if (edit.undone) {
        records_.erase(records_.begin() + static_cast<std::ptrdiff_t>(*edit.undone));
    }
    if (edit.record) {
        records_.push_back(std::move(*edit.record));
        if (records_.size() > mostRecords) {
            records_.erase(records_.begin());
        }
    }
}

} // namespace kareport
