#include "PageLines.h"

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

int lastNotBlank(int stop, const PageLines::IsBlank &isBlank)
{
    int line = stop - 1;
    while (line >= 0 && isBlank(line)) {
        --line;
    }
    return line;
}

} // namespace

void PageLines::load(std::vector<int> starts, int lineCount, const IsBlank &isBlank)
{
    starts_ = std::move(starts);
    lineCount_ = lineCount;
    lastLine_ = lastNotBlank(lineCount_, isBlank);
    lastCounted_ = lastNotBlank(std::min(stop(), lastLine_ + 1), isBlank);
}

void PageLines::replace(int line, int removed, int added, const std::vector<int> &starts, const IsBlank &isBlank)
{
    const int lastEdited = line + removed; // the last line that the edit has touched, as it was
    const int growth = added - removed;
    const int stopBefore = stop();

    const auto first = std::lower_bound(starts_.begin(), starts_.end(), line);
    auto last = std::upper_bound(first, starts_.end(), lastEdited);
    if (growth != 0) {
        std::for_each(last, starts_.end(), [growth](int &start) { start += growth; });
    }
    if (first != last || !starts.empty()) {
        last = starts_.erase(first, last);
        starts_.insert(last, starts.begin(), starts.end());
    }
    lineCount_ += growth;

    const auto follow = [&](int lastLine, int lineStop) {
        return lastLine > lastEdited ? lastLine + growth : lastNotBlank(std::min(lineStop, line + added + 1), isBlank);
    };
    lastLine_ = follow(lastLine_, lineCount_);
    const bool isSamePart = stop() == (stopBefore > lastEdited ? stopBefore + growth : stopBefore) &&
                            (stopBefore <= line || stopBefore > lastEdited);
    if (!isSamePart) {
        lastCounted_ = lastNotBlank(std::min(stop(), lastLine_ + 1), isBlank);
    } else if (stopBefore > lastEdited) {
        lastCounted_ = follow(lastCounted_, stop());
    }
}

int PageLines::countedPages(int linesPerPage) const
{
    return lastCounted_ < 0 ? 0 : lastCounted_ / std::max(1, linesPerPage) + 1;
}

int PageLines::pageCount(int linesPerPage) const
{
    const auto begun = std::upper_bound(starts_.begin(), starts_.end(), lastLine_) - starts_.begin();
    return std::max(1, countedPages(linesPerPage) + static_cast<int>(begun));
}

int PageLines::pageOf(int line, int linesPerPage) const
{
    const int counted = countedPages(linesPerPage);
    const auto begun = std::upper_bound(starts_.begin(), starts_.end(), line) - starts_.begin();
    const int page =
        begun > 0 ? counted + static_cast<int>(begun) : std::min(counted, line / std::max(1, linesPerPage) + 1);
    return std::clamp(page, 1, pageCount(linesPerPage));
}

int PageLines::firstLineOf(int page, int linesPerPage) const
{
    const int counted = countedPages(linesPerPage);
    const int wanted = std::clamp(page, 1, pageCount(linesPerPage));
    if (lastLine_ < 0) {
        return 0; // blank lines alone are one page
    }
    if (wanted <= counted || starts_.empty()) {
        return (wanted - 1) * std::max(1, linesPerPage);
    }
    return starts_[static_cast<std::size_t>(wanted - counted - 1)];
}

} // namespace kareport
