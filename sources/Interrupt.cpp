#include "Interrupt.h"

#include <atomic>

namespace kareport
{

namespace
{

std::atomic<bool> interrupted{false};

// What a signal's handler uses must be free of locks.
static_assert(std::atomic<bool>::is_always_lock_free);

} // namespace

bool isInterrupted()
{
    return interrupted;
}

void setInterrupted(bool isSet)
{
    interrupted = isSet;
}

} // namespace kareport
