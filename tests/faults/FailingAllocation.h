#pragma once

#include <QtGlobal>

#include <cstddef>

/// Lets a request for memory fail: whatever asks for it on this thread, as everything that is written in C or C++ does it
/// through `malloc` and its relatives. One at a time.
class FailingAllocation
{
public:
    enum class Extent
    {
        One,
        AllAfter ///< also those that come after it: a second request, for less, fails as well
    };

    /// @param number  which request from now on fails, from 1; 0 for none
    /// @param leastBytes  only requests for so many bytes count: what Qt asks for beside the text does not survive it
    explicit FailingAllocation(qint64 number, std::size_t leastBytes = 0, Extent extent = Extent::One);
    ~FailingAllocation();
    FailingAllocation(const FailingAllocation &) = delete;
    FailingAllocation &operator=(const FailingAllocation &) = delete;

    /// Whether it has failed.
    bool hasFailed() const;
};
