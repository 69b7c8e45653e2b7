#pragma once

#include "MappedFile.h"

#include <QString>
#include <QTemporaryFile>

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

namespace kareport
{

/// Bytes that are made one after the other and then read: few are held, many are kept in a temporary file without a name, so
/// that memory does not grow with them.
class SpooledBytes
{
public:
    /// Adds bytes. @return whether they are kept; `wrong` says why not
    bool append(std::string_view bytes)
    {
        buffer_.append(bytes);
        return flushFull();
    }
    /// Where bytes may be added at the end, with `flushFull` now and then.
    std::string &buffer() { return buffer_; }
    /// Writes what is held when it has become much. @return whether it is kept
    bool flushFull() { return buffer_.size() < flushedAt || flush(); }
    /// How many bytes were added.
    std::size_t size() const { return written_ + buffer_.size(); }

    /// Ends the adding. @return whether all bytes are kept
    bool finish();
    /// All bytes, after `finish`.
    std::string_view view() const { return view_; }
    /// Gives the memory of the bytes between two positions back to the system. What is read there again comes from the
    /// temporary file.
    void release(std::size_t begin, std::size_t end) const;
    /// What is wrong with the temporary file.
    QString wrong() const;

private:
    static constexpr std::size_t flushedAt = std::size_t(1) << 20;

    bool flush();

    std::string buffer_;
    std::unique_ptr<QTemporaryFile> file_;
    std::unique_ptr<MappedFile> mapped_;
    std::size_t written_ = 0;
    std::string_view view_;
};

} // namespace kareport
