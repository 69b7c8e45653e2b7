#include "UnfinishedFile.h"

#include <array>
#include <atomic>
#include <climits>
#include <cstdio>
#include <sys/stat.h>
#include <unistd.h>

namespace kareport
{

namespace
{

// One at a time is enough for the programs that are ended by signals: they write their outputs in turn. Another one that
// is open at the same time is not remembered.
std::array<char, PATH_MAX> name;
std::atomic<int> owner{-1}; ///< the handle that the name belongs to
std::atomic<bool> isKnown{false};

bool readName(int handle)
{
    struct stat status = {};
    if (fstat(handle, &status) != 0 || status.st_nlink == 0) {
        return false;
    }
    std::array<char, 64> entry;
    std::snprintf(entry.data(), entry.size(), "/proc/self/fd/%d", handle);
    const ssize_t size = readlink(entry.data(), name.data(), name.size() - 1);
    if (size <= 0) {
        return false;
    }
    name[static_cast<std::size_t>(size)] = '\0';
    return true;
}

} // namespace

UnfinishedFile::UnfinishedFile(int handle)
{
    int none = -1;
    if (handle >= 0 && owner.compare_exchange_strong(none, handle)) {
        handle_ = handle;
        isKnown = readName(handle);
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
    if (isKnown) {
        unlink(name.data());
    }
}

} // namespace kareport
