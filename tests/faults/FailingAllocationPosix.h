#pragma once

#include <QtGlobal>

/// Lets one request for memory fail: whatever asks for it on this thread, as everything that is written in C or C++ does it
/// through `malloc` and its relatives. One at a time.
class FailingAllocation
{
public:
    /// @param number  which request from now on fails, from 1; 0 for none
    explicit FailingAllocation(qint64 number);
    ~FailingAllocation();
    FailingAllocation(const FailingAllocation &) = delete;
    FailingAllocation &operator=(const FailingAllocation &) = delete;

    /// Whether it has failed.
    bool hasFailed() const;
};
