#pragma once

#include <atomic>
#include <cstddef>
#include <string_view>

namespace kareport
{

/// A file's bytes, mapped into memory. Where the file is cut short while it is read, or the disk fails, its lost
/// part reads as zeros, and `isLost` says so: that must be asked before what was read is believed.
class MappedFile
{
public:
    MappedFile() = default;
    ~MappedFile();
    MappedFile(const MappedFile &) = delete;
    MappedFile &operator=(const MappedFile &) = delete;

    /// @return whether the file could be mapped
    bool map(int handle, std::size_t size);
    std::string_view view() const { return {begin_, size_}; }
    bool isLost() const;
    /// Gives the memory of the bytes before one back to the system: a large file that is read in one pass is then
    /// never in memory as a whole. What is read there again comes from the file again.
    void release(std::size_t end) const;
    /// The same for the bytes between two, from the page of the first one to the one before the page of the second.
    void release(std::size_t begin, std::size_t end) const;

private:
    char *begin_ = nullptr;
    std::size_t size_ = 0;
    std::size_t slot_ = 0;
};

} // namespace kareport
