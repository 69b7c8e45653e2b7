#include "PendingEdits.h"

#include <algorithm>

namespace kareport
{

void PendingEdits::replace(qint64 at, qint64 removed, QStringView inserted)
{
    // The edits change first: without memory for that, nothing has changed.
    replaceInEdits(at, removed, inserted);
    growth_ += inserted.size() - removed;
    inserted_ += inserted.size();
}

void PendingEdits::replaceInEdits(qint64 at, qint64 removed, QStringView inserted)
{
    const qint64 end = at + removed;
    // The first edit that ends at the place or after it, and by how much those before it shift the text.
    qint64 shift = 0;
    auto first = edits_.begin();
    while (first != edits_.end() && first->at + shift + first->inserted.size() < at) {
        shift += first->inserted.size() - first->removed;
        ++first;
    }
    if (first == edits_.end() || first->at + shift > end) {
        edits_.insert(first, {at - shift, removed, inserted.toString()});
        return;
    }
    const qint64 firstStart = first->at + shift;
    if (firstStart <= at && end <= firstStart + first->inserted.size()) {
        first->inserted.replace(at - firstStart, removed, inserted.data(), inserted.size());
        return;
    }

    // Several edits, and the text next to them, become one.
    auto last = first;
    qint64 lastStart = firstStart;
    for (auto next = last + 1; next != edits_.end(); ++next) {
        const qint64 nextStart = next->at + lastStart - last->at + last->inserted.size() - last->removed;
        if (nextStart > end) {
            break;
        }
        last = next;
        lastStart = nextStart;
    }
    const qint64 lastEnd = lastStart + last->inserted.size();
    const qint64 before = std::max<qint64>(0, firstStart - at);
    const qint64 tail = std::max<qint64>(0, end - lastEnd);
    Edit merged{first->at - before, 0, first->inserted.first(std::max<qint64>(0, at - firstStart))};
    merged.removed = last->at + last->removed + tail - merged.at;
    merged.inserted += inserted;
    merged.inserted += QStringView(last->inserted).last(std::max<qint64>(0, lastEnd - end));
    *first = std::move(merged);
    edits_.erase(first + 1, last + 1);
}

void PendingEdits::clear()
{
    edits_.clear();
    growth_ = 0;
    inserted_ = 0;
}

} // namespace kareport
