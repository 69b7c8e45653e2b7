#include "FailingAllocation.h"

#include <cerrno>
#include <cstddef>

// What the C library itself calls its functions by, so that a program can put its own in their place.
// NOLINTBEGIN(bugprone-reserved-identifier)
extern "C" {
void *__libc_malloc(std::size_t size);
void *__libc_calloc(std::size_t count, std::size_t size);
void *__libc_realloc(void *memory, std::size_t size);
void *__libc_memalign(std::size_t alignment, std::size_t size);
}

namespace
{

thread_local constinit qint64 left = 0;
thread_local constinit std::size_t least = 0;
thread_local constinit bool isRefused = false;
thread_local constinit bool refusesAllAfter = false;

bool refuses(std::size_t bytes)
{
    if (left == 0 || bytes < least || --left > 0) {
        return false;
    }
    left = refusesAllAfter ? 1 : 0;
    isRefused = true;
    errno = ENOMEM;
    return true;
}

} // namespace

// `operator new` of the standard library calls these as well.
extern "C" {

__attribute__((visibility("default"))) void *malloc(std::size_t size)
{
    return refuses(size) ? nullptr : __libc_malloc(size);
}
__attribute__((visibility("default"))) void *calloc(std::size_t count, std::size_t size)
{
    return refuses(count * size) ? nullptr : __libc_calloc(count, size);
}
__attribute__((visibility("default"))) void *realloc(void *memory, std::size_t size)
{
    return refuses(size) ? nullptr : __libc_realloc(memory, size);
}
__attribute__((visibility("default"))) void *aligned_alloc(std::size_t alignment, std::size_t size)
{
    return refuses(size) ? nullptr : __libc_memalign(alignment, size);
}
__attribute__((visibility("default"))) int posix_memalign(void **memory, std::size_t alignment, std::size_t size)
{
    void *made = refuses(size) ? nullptr : __libc_memalign(alignment, size);
    if (made == nullptr) {
        return ENOMEM;
    }
    *memory = made;
    return 0;
}
}
// NOLINTEND(bugprone-reserved-identifier)

FailingAllocation::FailingAllocation(qint64 number, std::size_t leastBytes, Extent extent)
{
    least = leastBytes;
    refusesAllAfter = extent == Extent::AllAfter;
    isRefused = false;
    left = number;
}

FailingAllocation::~FailingAllocation()
{
    left = 0;
}

bool FailingAllocation::hasFailed() const
{
    return isRefused;
}
