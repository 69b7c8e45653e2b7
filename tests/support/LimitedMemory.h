#pragma once

#include <cstddef>
#include <cstdlib>
#include <limits>

/// Memory that ends: blocks larger than a limit cannot be allocated. One at a time.
class LimitedMemory
{
public:
    explicit LimitedMemory(std::size_t largestBlock = std::numeric_limits<std::size_t>::max())
    {
        largest = largestBlock;
        calls = 0;
        lastBytes = 0;
    }
    /// Room for so many characters of one byte and the 0 after them.
    static LimitedMemory ofCharacters(std::size_t characters) { return LimitedMemory(bytesFor(characters)); }
    static std::size_t bytesFor(std::size_t characters) { return characters + 1; }
    /// Room for so many characters of UTF-16 and the 0 after them.
    static LimitedMemory ofWideCharacters(std::size_t characters) { return LimitedMemory(wideBytesFor(characters)); }
    static std::size_t wideBytesFor(std::size_t characters) { return (characters + 1) * sizeof(char16_t); }

    static void *reallocate(void *memory, std::size_t bytes)
    {
        ++calls;
        lastBytes = bytes;
        return bytes > largest ? nullptr : std::realloc(memory, bytes);
    }

    static inline std::size_t largest = 0;
    static inline int calls = 0;
    static inline std::size_t lastBytes = 0;
};
