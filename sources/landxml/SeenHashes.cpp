#include "SeenHashes.h"

#include <algorithm>
#include <utility>

namespace kareport
{

bool SeenHashes::add(std::uint64_t hash)
{
    if (2 * (count_ + 1) > places_.size()) {
        grow();
    }
    const bool isNew = place(std::max<std::uint64_t>(hash, 1));
    count_ += isNew ? 1 : 0;
    return isNew;
}

void SeenHashes::clear()
{
    places_.clear();
    count_ = 0;
}

/// Puts a hash where it belongs, or into the next free place. @return whether it was not there
bool SeenHashes::place(std::uint64_t hash)
{
    const std::size_t last = places_.size() - 1;
    std::size_t at = hash & last;
    while (places_[at] != 0 && places_[at] != hash) {
        at = (at + 1) & last;
    }
    return std::exchange(places_[at], hash) == 0;
}

void SeenHashes::grow()
{
    constexpr std::size_t least = 1024;
    std::vector<std::uint64_t> before(std::max(least, 2 * places_.size()));
    before.swap(places_);
    for (const std::uint64_t hash : before) {
        if (hash != 0) {
            place(hash);
        }
    }
}

} // namespace kareport
