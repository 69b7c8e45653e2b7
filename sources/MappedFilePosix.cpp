#include "MappedFile.h"

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdint>
#include <mutex>
#include <sys/mman.h>
#include <unistd.h>

namespace kareport
{

namespace
{

/// What a handler knows of a mapped file. A free slot has no bytes.
struct Slot
{
    std::atomic<std::uintptr_t> begin{0};
    std::atomic<std::uintptr_t> end{0};
    std::atomic<bool> isLost{false};
};

std::array<Slot, 64> slots; // more files than that are read instead
std::mutex slotsMutex;      ///< of those who take slots; a handler only reads them
std::uintptr_t pageSize = 0;
struct sigaction otherHandler;

static_assert(std::atomic<std::uintptr_t>::is_always_lock_free);

/// Replaces what can no longer be read by zeros, from the current page to the end of the mapping.
bool replaceByZeros(Slot &slot, std::uintptr_t address)
{
    const std::uintptr_t page = address - address % pageSize;
    slot.isLost = true;
    // NOLINTNEXTLINE(performance-no-int-to-ptr): the address comes from the system
    return mmap(reinterpret_cast<void *>(page), slot.end - page, PROT_READ, MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED, -1,
                0) != MAP_FAILED;
}

extern "C" void readLostPage(int signal, siginfo_t *info, void *context)
{
    const auto address = reinterpret_cast<std::uintptr_t>(info->si_addr);
    for (Slot &slot : slots) {
        if (address >= slot.begin && address < slot.end && replaceByZeros(slot, address)) {
            return;
        }
    }
    // It is none of ours: the handler before this one takes it, or the process ends by it when the access is tried again.
    if ((static_cast<unsigned>(otherHandler.sa_flags) & SA_SIGINFO) != 0) {
        otherHandler.sa_sigaction(signal, info, context);
    } else {
        sigaction(SIGBUS, &otherHandler, nullptr);
    }
}

void installHandler()
{
    pageSize = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
    struct sigaction action = {};
    action.sa_sigaction = readLostPage;
    action.sa_flags = SA_SIGINFO;
    sigaction(SIGBUS, &action, &otherHandler);
}

} // namespace

bool MappedFile::map(int handle, std::size_t size)
{
    static std::once_flag installed;
    std::call_once(installed, installHandler);
    const std::lock_guard lock(slotsMutex);
    for (slot_ = 0; slot_ < slots.size() && slots[slot_].end != 0; ++slot_) {
    }
    void *bytes = slot_ < slots.size() ? mmap(nullptr, size, PROT_READ, MAP_PRIVATE, handle, 0) : MAP_FAILED;
    if (bytes == MAP_FAILED) {
        return false;
    }
    begin_ = static_cast<char *>(bytes);
    size_ = size;
    Slot &slot = slots[slot_];
    slot.isLost = false;
    slot.begin = reinterpret_cast<std::uintptr_t>(begin_);
    slot.end = (slot.begin + size + pageSize - 1) / pageSize * pageSize;
    return true;
}

MappedFile::~MappedFile()
{
    if (begin_ != nullptr) {
        const std::lock_guard lock(slotsMutex);
        slots[slot_].end = 0;
        munmap(begin_, size_);
    }
}

void MappedFile::release(std::size_t end) const
{
    // Now and then: for each block it would cost more than the memory is worth.
    constexpr std::size_t piece = std::size_t(1) << 22;
    const std::size_t whole = end / piece * piece;
    if (begin_ != nullptr && whole >= piece && end - whole < piece / 32) {
        madvise(begin_ + (whole - piece), piece, MADV_DONTNEED);
    }
}

void MappedFile::release(std::size_t begin, std::size_t end) const
{
    // Before the first mapping of the process the size of a page is not known.
    if (begin_ == nullptr) {
        return;
    }
    const std::size_t first = begin / pageSize * pageSize;
    const std::size_t last = std::min(end, size_) / pageSize * pageSize;
    if (first < last) {
        madvise(begin_ + first, last - first, MADV_DONTNEED);
    }
}

bool MappedFile::isLost() const
{
    return begin_ != nullptr && slots[slot_].isLost;
}

} // namespace kareport
