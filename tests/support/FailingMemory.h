#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <unordered_map>

/// Memory whose n-th request is refused, and that lies elsewhere after each other one: what still reads the old place finds
/// letters. One at a time.
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
            return moved(memory, bytes);
        }
        left = isAlone ? 0 : 1;
        hasRefused = true;
        return nullptr;
    }

    static inline int left = 0;
    static inline bool isAlone = false;
    static inline bool hasRefused = false; ///< since `refuse`

private:
    static void *moved(void *memory, std::size_t bytes)
    {
        void *place = std::malloc(bytes);
        if (memory != nullptr && place != nullptr) {
            std::memcpy(place, memory, std::min(bytes, sizes[memory]));
            std::memset(memory, 'z', sizes[memory]);
            std::free(memory);
        }
        sizes[place] = bytes;
        return place;
    }

    static inline std::unordered_map<void *, std::size_t> sizes;
};
