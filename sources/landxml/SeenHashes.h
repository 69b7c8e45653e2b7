#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace kareport
{

/// Hashes that have been met, in one piece of memory: for millions of names a set with nodes takes most of the time that
/// reading them takes.
class SeenHashes
{
public:
    /// Adds a hash. @return whether it is new
    bool add(std::uint64_t hash);
    /// Prefetches the memory that a hash will need: waiting for it takes longer than anything else.
    void prepare(std::uint64_t hash) const
    {
        if (!places_.empty()) {
            __builtin_prefetch(&places_[hash & (places_.size() - 1)]);
        }
    }
    void clear();

private:
    bool place(std::uint64_t hash);
    void grow();

    std::vector<std::uint64_t> places_; ///< a power of two of them; 0 is free
    std::size_t count_ = 0;
};

} // namespace kareport
