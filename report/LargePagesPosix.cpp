#include "LargePages.h"

#ifdef __linux__
#include <sys/mman.h>
#include <unistd.h>

#include <cstdint>
#endif

namespace kareport
{

void preferLargePages([[maybe_unused]] void *memory, [[maybe_unused]] std::size_t bytes)
{
#ifdef __linux__
    // Whole pages are asked for; the beginning of the first one belongs to somebody else.
    const auto page = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
    const std::uintptr_t begin = (reinterpret_cast<std::uintptr_t>(memory) + page - 1) / page * page;
    const std::uintptr_t end = (reinterpret_cast<std::uintptr_t>(memory) + bytes) / page * page;
    if (begin < end) {
        madvise(reinterpret_cast<void *>(begin), end - begin, MADV_HUGEPAGE); // a hint: no answer is needed
    }
#endif
}

} // namespace kareport
