#pragma once

#include "InputError.h"
#include "MappedFile.h"
#include "SpooledBytes.h"

#include <QByteArray>
#include <QFile>
#include <QString>

#include <memory>
#include <optional>
#include <string_view>

namespace kareport
{

/// The bytes of a file. A large one is mapped where the system can, so that it is never in memory as a whole; what comes
/// out of a pipe is kept in a temporary file when it is much.
class FileBytes
{
public:
    /// Opening and reading a pipe, which may wait, ends when the program is interrupted.
    static Expected<std::shared_ptr<const FileBytes>> open(const QString &path);

    /// Bytes that are in memory already. @param path  names them in messages
    static std::shared_ptr<const FileBytes> holding(const QString &path, const QByteArray &content);
    /// What comes out of the program's standard input, until its end. It can be read once only. Its path is "-".
    static Expected<std::shared_ptr<const FileBytes>> openStandardInput();
    /// Bytes that were made of a file's.
    static Expected<std::shared_ptr<const FileBytes>> ofSpooled(const QString &path, SpooledBytes &&bytes);

    std::string_view view() const { return view_; }
    const QString &path() const { return path_; }
    /// Says that what comes before a byte is not read again soon.
    void release(std::size_t end) const { mapped_.release(end); }
    /// Gives the memory of what was read back to the system, a large piece at a time, for a reader that goes on from there.
    /// @param end       what comes before it is not read again soon
    /// @param released  up to where memory was given back; it is moved on
    void releaseBefore(std::size_t end, std::size_t &released) const
    {
        constexpr std::size_t piece = std::size_t(1) << 22;
        if (end > released && end - released >= piece) {
            releasePiece(released, end);
            released = end;
        }
    }
    /// What went wrong since the file was opened: bytes that were cut off meanwhile read as zeros. It must be asked when all
    /// was read, and when what was read is wrong.
    std::optional<InputError> lostBytes() const;

private:
    void releasePiece(std::size_t begin, std::size_t end) const;
    static Expected<std::shared_ptr<const FileBytes>> ofHandle(const QString &path, int handle);
    std::optional<QString> read(qint64 size);
    std::optional<QString> readPipe();

    QString path_;
    QFile file_;
    MappedFile mapped_;
    QByteArray content_;   ///< of a file that is not mapped
    SpooledBytes spooled_; ///< of a pipe
    std::string_view view_;
};

} // namespace kareport
