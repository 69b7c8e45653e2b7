#include "PageStarts.h"

#include "PageHeader.h"

#include <QHash>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

constexpr std::size_t mostPieces = 256;
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

PageStarts::Piece PageStarts::Piece::of(qint64 at, QStringView text)
{
    return {at, text.size(), qHash(text), qHash(text, otherSeed), {}};
}

bool PageStarts::Piece::holdsSame(const Piece &other) const
{
    return length == other.length && hash == other.hash && otherHash == other.otherHash;
}

bool PageStarts::Piece::bringsPages() const
{
    // A line end alone, or a character, is what anybody types anywhere.
    return length > 2 ||
           std::any_of(offsets.begin(), offsets.end(), [this](qint64 offset) { return offset > 0 && offset < length; });
}

void PageStarts::clear()
{
    positions_.clear();
    pieces_.clear();
}

void PageStarts::assign(std::vector<qint64> positions)
{
    positions.erase(std::remove_if(positions.begin(), positions.end(), [](qint64 at) { return at < 0; }),
                    positions.end());
    sortOut(positions);
    positions_ = std::move(positions);
    pieces_.clear();
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
    return inserted > 0 || (first != positions_.end() && *first <= at + removed);
}

PageStarts::Edit PageStarts::prepare(qint64 at, qint64 removed, QStringView removedText, QStringView inserted)
{
    Edit edit;
    const auto first = std::lower_bound(positions_.begin(), positions_.end(), at);
    const auto last = std::upper_bound(first, positions_.end(), at + removed);
    edit.first = static_cast<std::size_t>(first - positions_.begin());
    edit.last = static_cast<std::size_t>(last - positions_.begin());
    edit.growth = inserted.size() - removed;
    const bool isSeen = !removedText.isEmpty();
    const Difference changed = isSeen ? differenceOf(at, removedText, inserted) : Difference{at, {}, inserted};
    edit.at = changed.at;
    edit.removed = isSeen ? changed.removed.size() : removed;
    const qint64 end = edit.at + edit.removed;
    const qint64 newEnd = end + edit.growth;
    const auto isTouched = [&](qint64 start) { return start >= edit.at && start <= end; };

    // What was removed before comes back with its pages.
    std::vector<qint64> brought;
    if (!pieces_.empty() && !changed.inserted.isEmpty()) {
        const Piece put = Piece::of(edit.at, changed.inserted);
        const auto same =
            std::find_if(pieces_.rbegin(), pieces_.rend(), [&put](const Piece &piece) { return piece.holdsSame(put); });
        if (same != pieces_.rend()) {
            const bool wasAtEnd = same->offsets.front() == 0 || same->offsets.back() == same->length;
            if (same->at == put.at && (!wasAtEnd || std::any_of(first, last, isTouched))) {
                edit.undone = static_cast<std::size_t>(pieces_.rend() - same) - 1;
            }
            for (const qint64 offset : same->offsets) {
                if (edit.undone || (same->bringsPages() && offset < same->length)) {
                    brought.push_back(edit.at + offset);
                }
            }
        }
    }
    if (!edit.undone) {
        for (const qint64 header : pageHeadersIn(inserted)) {
            brought.push_back(at + header);
        }
    }

    const bool isBroughtFirst = std::find(brought.begin(), brought.end(), edit.at) != brought.end();
    const bool isBefore = isBroughtFirst || (edit.at > 0 && changed.inserted.endsWith(u'\n'));
    for (auto start = first; start != last; ++start) {
        if (!isTouched(*start)) {
            edit.middle.push_back(*start < edit.at ? *start : *start + edit.growth);
        } else if (edit.undone) {
            continue;
        } else if (edit.removed == 0) {
            edit.middle.push_back(isBefore ? newEnd : edit.at);
        } else if (*start == edit.at) {
            edit.middle.push_back(edit.at);
        } else if (*start == end) {
            edit.middle.push_back(newEnd);
        }
    }
    edit.middle.insert(edit.middle.end(), brought.begin(), brought.end());
    sortOut(edit.middle);

    if (isSeen && edit.removed > 0 && std::any_of(first, last, isTouched)) {
        edit.removedPiece = Piece::of(edit.at, changed.removed);
        for (auto start = first; start != last; ++start) {
            if (isTouched(*start)) {
                edit.removedPiece->offsets.push_back(*start - edit.at);
            }
        }
        pieces_.reserve(mostPieces + 1);
    }
    positions_.reserve(positions_.size() + edit.middle.size());
    return edit;
}

void PageStarts::carryOut(Edit &&edit) noexcept
{
    const auto begin = positions_.begin() + static_cast<std::ptrdiff_t>(edit.first);
    const auto behind = positions_.erase(begin, positions_.begin() + static_cast<std::ptrdiff_t>(edit.last));
    for (auto start = behind; start != positions_.end(); ++start) {
        *start += edit.growth;
    }
    positions_.insert(behind, edit.middle.begin(), edit.middle.end());

    const qint64 end = edit.at + edit.removed;
    for (Piece &piece : pieces_) {
        if (piece.at > end || (piece.at == end && (edit.removed > 0 || !edit.undone))) {
            piece.at += edit.growth;
        } else if (piece.at > edit.at) {
            piece.at = edit.at;
        }
    }
    if (edit.undone) {
        pieces_.erase(pieces_.begin() + static_cast<std::ptrdiff_t>(*edit.undone));
    }
    if (edit.removedPiece) {
        pieces_.push_back(std::move(*edit.removedPiece));
        if (pieces_.size() > mostPieces) {
            pieces_.erase(pieces_.begin());
        }
    }
}

} // namespace kareport
