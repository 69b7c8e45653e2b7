#include "ScanText.h"

#include <algorithm>

namespace kareport
{

ScanText::ScanText(QString text) : text_(std::move(text)), runs_{{0, 0}} {}

void ScanText::append(QStringView characters, qsizetype source)
{
    if (characters.isEmpty()) {
        return;
    }
    const bool continues = !runs_.empty() && runs_.back().source + (text_.size() - runs_.back().at) == source;
    if (!continues) {
        runs_.push_back({text_.size(), source});
    }
    text_.append(characters);
}

std::size_t ScanText::runAt(qsizetype position) const
{
    const auto next = std::upper_bound(runs_.begin(), runs_.end(), position,
                                       [](qsizetype wanted, const Run &run) { return wanted < run.at; });
    return static_cast<std::size_t>(next - runs_.begin()) - 1;
}

qsizetype ScanText::sourceOf(qsizetype position) const
{
    if (runs_.empty()) {
        return 0;
    }
    // The end belongs to the run of the last character, also where a cut left an empty run after it.
    const Run &run = runs_[runAt(position == text_.size() && position > 0 ? position - 1 : position)];
    return run.source + (position - run.at);
}

ScanText ScanText::sliced(qsizetype from, qsizetype count) const
{
    ScanText slice;
    slice.text_ = text_.sliced(from, count);
    if (runs_.empty()) {
        return slice;
    }
    for (std::size_t i = runAt(from); i < runs_.size() && (runs_[i].at < from + count || slice.runs_.empty()); ++i) {
        const qsizetype at = std::max(runs_[i].at, from);
        slice.runs_.push_back({at - from, runs_[i].source + (at - runs_[i].at)});
    }
    return slice;
}

void ScanText::removeRuns(qsizetype from, qsizetype count)
{
    const qsizetype stop = from + count;
    const auto firstGone = std::lower_bound(runs_.begin(), runs_.end(), from,
                                            [](const Run &run, qsizetype wanted) { return run.at < wanted; });
    if (stop >= size()) {
        // With nothing left at all, the first run says where the text was.
        runs_.erase(firstGone == runs_.begin() ? firstGone + 1 : firstGone, runs_.end());
        return;
    }
    const auto last = runs_.begin() + static_cast<std::ptrdiff_t>(runAt(stop));
    const Run rest = {from, last->source + (stop - last->at)};
    for (auto run = last + 1; run != runs_.end(); ++run) {
        run->at -= count;
    }
    if (firstGone > last) {
        runs_.insert(firstGone, rest);
    } else {
        *firstGone = rest;
        runs_.erase(firstGone + 1, last + 1);
    }
}

void ScanText::remove(qsizetype from, qsizetype count)
{
    if (!runs_.empty()) {
        removeRuns(from, count);
    }
    text_.remove(from, count);
}

} // namespace kareport
