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
    // The end belongs to the run of the last character, also where a cut left an empty run behind it.
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

void ScanText::remove(qsizetype from, qsizetype count)
{
    const ScanText rest = sliced(from + count, size() - from - count);
    *this = sliced(0, from);
    text_.append(rest.text_);
    for (const Run &run : rest.runs_) {
        if (run.at < rest.size()) {
            runs_.push_back({from + run.at, run.source});
        }
    }
    // With nothing before the cut, the run that stood at the front holds no character any more.
    if (from == 0 && runs_.size() > 1) {
        runs_.erase(runs_.begin());
    }
}

} // namespace kareport
