#include "Progress.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qint64 millisecondsBetween = 100;

} // namespace

void Progress::expectPieces(std::size_t count)
{
    pieces_ = std::max<std::size_t>(count, 1);
    begun_ = 0;
}

void Progress::beginShare(std::size_t number, std::size_t count)
{
    share_ = number;
    shares_ = std::max<std::size_t>(count, 1);
    expectPieces(1);
}

double Progress::partOfAll(std::size_t done)
{
    const double inPiece = total_ > 0 ? double(std::min(done, total_)) / double(total_) : 0;
    // More pieces than were expected belong to the last one.
    const std::size_t before = std::min(begun_ > 0 ? begun_ - 1 : 0, pieces_ - 1);
    const double inShare = (double(before) + inPiece) / double(pieces_);
    furthest_ = std::max(furthest_, (double(share_) + inShare) / double(shares_));
    return furthest_;
}

void Progress::begin(const QString &what, std::size_t total)
{
    what_ = what;
    total_ = total;
    ++begun_;
    if (shown_ && (prefix_.isEmpty() || !sinceShown_.isValid() || sinceShown_.elapsed() >= millisecondsBetween)) {
        sinceShown_.start();
        show(0);
    }
}

void Progress::advance(std::size_t done)
{
    if (shown_ && sinceShown_.elapsed() >= millisecondsBetween) {
        sinceShown_.start();
        show(done);
    }
}

void Progress::advance(std::size_t done, std::size_t total)
{
    total_ = total;
    advance(done);
}

} // namespace kareport
