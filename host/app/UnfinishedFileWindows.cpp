#include "UnfinishedFile.h"

#include <windows.h>

#include <io.h>

#include <array>
#include <atomic>

namespace kareport
{

namespace
{

constexpr DWORD longestPath = 32768;

// One at a time is enough for the programs that are ended from outside: they write their outputs in turn. Another one that
// is open at the same time is not remembered.
std::array<wchar_t, longestPath> name;
std::atomic<int> owner{-1}; ///< the handle that the name belongs to
std::atomic<bool> isKnown{false};

HANDLE fileOf(int handle)
{
    // NOLINTNEXTLINE(performance-no-int-to-ptr): the C library gives it so
    return reinterpret_cast<HANDLE>(_get_osfhandle(handle));
}

} // namespace

UnfinishedFile::UnfinishedFile(int handle)
{
    int none = -1;
    if (handle >= 0 && owner.compare_exchange_strong(none, handle)) {
        handle_ = handle;
        const DWORD size = GetFinalPathNameByHandleW(fileOf(handle), name.data(), longestPath, FILE_NAME_NORMALIZED);
        isKnown = size > 0 && size < longestPath;
    }
}

UnfinishedFile::~UnfinishedFile()
{
    if (handle_ >= 0) {
        isKnown = false;
        owner = -1;
    }
}

void UnfinishedFile::remove()
{
    if (isKnown.exchange(false)) {
        // Nothing that is open can be removed. The process ends right after this.
        CloseHandle(fileOf(owner));
        DeleteFileW(name.data());
    }
}

} // namespace kareport
