#pragma once

#include <cstddef>
#include <cstdlib>

/// Memory whose n-th request is refused. One at a time.
class FailingMemory
{
public:
    /// Refuses a request and all after it; for a number below 0, that one alone; none for 0.
    static void refuse(int request)
    {
        left = request < 0 ? -request : request;
        isAlone = request < 0;
        hasRefused = false;
    }
    static void *reallocate(void *memory, std::size_t bytes)
    {
        if (left != 1) {
            left -= left > 1 ? 1 : 0;
            return std::realloc(memory, bytes);
        }
        left = isAlone ? 0 : 1;
        hasRefused = true;
        return nullptr;
    }

    static inline int left = 0;
    static inline bool isAlone = false;
    static inline bool hasRefused = false; ///< since `refuse`
};
