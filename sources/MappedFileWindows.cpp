#include "MappedFile.h"

#include <windows.h>

#include <io.h>

#include <algorithm>

namespace kareport
{

namespace
{

HANDLE systemHandle(int handle)
{
    // NOLINTNEXTLINE(performance-no-int-to-ptr): the C library gives it so
    return reinterpret_cast<HANDLE>(_get_osfhandle(handle));
}

/// Whether the bytes come from another machine. When the connection to it ends, what is mapped ends the process.
bool isRemote(HANDLE file)
{
    FILE_REMOTE_PROTOCOL_INFO information = {};
    return GetFileInformationByHandleEx(file, FileRemoteProtocolInfo, &information, sizeof information) != FALSE;
}

/// Takes pages out of the process. What is read there again comes from the file again.
void giveBack(char *begin, std::size_t size)
{
    // Unlocking what is not locked does so, and is said to fail.
    VirtualUnlock(begin, size);
}

} // namespace

bool MappedFile::map(int handle, std::size_t size)
{
    HANDLE file = systemHandle(handle);
    if (isRemote(file)) {
        return false;
    }
    HANDLE mapping = CreateFileMappingW(file, nullptr, PAGE_READONLY, 0, 0, nullptr);
    void *bytes = mapping != nullptr ? MapViewOfFile(mapping, FILE_MAP_READ, 0, 0, size) : nullptr;
    if (mapping != nullptr) {
        CloseHandle(mapping); // the view keeps it
    }
    if (bytes == nullptr) {
        return false;
    }
    begin_ = static_cast<char *>(bytes);
    size_ = size;
    return true;
}

MappedFile::~MappedFile()
{
    if (begin_ != nullptr) {
        UnmapViewOfFile(begin_);
    }
}

void MappedFile::release(std::size_t end) const
{
    // Now and then: for each block it would cost more than the memory is worth.
    constexpr std::size_t piece = std::size_t(1) << 22;
    const std::size_t whole = end / piece * piece;
    if (begin_ != nullptr && whole >= piece && end - whole < piece / 32) {
        giveBack(begin_ + (whole - piece), piece);
    }
}

void MappedFile::release(std::size_t begin, std::size_t end) const
{
    constexpr std::size_t pageSize = 4096;
    const std::size_t first = begin / pageSize * pageSize;
    const std::size_t last = std::min(end, size_) / pageSize * pageSize;
    if (begin_ != nullptr && first < last) {
        giveBack(begin_ + first, last - first);
    }
}

bool MappedFile::isLost() const
{
    return false; // the system does not let a mapped file be cut short
}

} // namespace kareport
