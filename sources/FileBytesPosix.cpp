#include "FileBytes.h"

#include "Interrupt.h"
#include "Xlate.h"

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <system_error>
#include <unistd.h>

namespace kareport
{

namespace
{

/// What is read into memory from a pipe or a device, which may never end.
constexpr qsizetype largestUnmapped = qsizetype(1) << 30;
/// A smaller file is read: mapping it, and above all taking the mapping back on every processor, takes longer.
constexpr qint64 smallestMapped = qint64(1) << 20;
/// What a pipe is read in at first. The room grows with what comes.
constexpr qsizetype firstRoom = 64 * 1024;

QString systemReason()
{
    return QString::fromStdString(std::generic_category().message(errno));
}

QString cutShort()
{
    return Xlate("the file was cut short while it was read");
}

/// Opens a file as the system does. Qt's own opening goes on waiting for a pipe's writer when a signal comes.
int openHandle(const QString &path)
{
    int handle = -1;
    do {
        handle = ::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC);
    } while (handle < 0 && errno == EINTR && !isInterrupted());
    return handle;
}

/// @return the bytes that were read, 0 at the end, and below 0 when reading fails or the program is interrupted
ssize_t readSome(int handle, char *to, qsizetype most)
{
    ssize_t count = -1;
    do {
        count = ::read(handle, to, static_cast<std::size_t>(most));
    } while (count < 0 && errno == EINTR && !isInterrupted());
    return count;
}

} // namespace

Expected<std::shared_ptr<const FileBytes>> FileBytes::open(const QString &path)
{
    auto bytes = std::make_shared<FileBytes>();
    bytes->path_ = path;
    const int handle = openHandle(path);
    if (handle < 0) {
        return InputError{path, std::nullopt, systemReason()};
    }
    bytes->file_.open(handle, QIODevice::ReadOnly | QIODevice::Unbuffered, QFileDevice::AutoCloseHandle);
    const qint64 size = bytes->file_.size();
    if (size >= smallestMapped && bytes->mapped_.map(handle, static_cast<std::size_t>(size))) {
        bytes->view_ = bytes->mapped_.view();
        return std::shared_ptr<const FileBytes>(std::move(bytes));
    }
    if (const auto wrong = bytes->read(size)) {
        return InputError{path, std::nullopt, *wrong};
    }
    bytes->view_ = {bytes->content_.constData(), static_cast<std::size_t>(bytes->content_.size())};
    return std::shared_ptr<const FileBytes>(std::move(bytes));
}

std::shared_ptr<const FileBytes> FileBytes::holding(const QString &path, const QByteArray &content)
{
    auto bytes = std::make_shared<FileBytes>();
    bytes->path_ = path;
    bytes->content_ = content;
    bytes->view_ = {bytes->content_.constData(), static_cast<std::size_t>(bytes->content_.size())};
    return bytes;
}

/// Reads a file of a size, or until its end one that has none. @return what is wrong with it
std::optional<QString> FileBytes::read(qint64 size)
{
    qsizetype used = 0;
    for (ssize_t count = 1; count > 0; used += std::max<ssize_t>(count, 0)) {
        if (used > largestUnmapped) {
            return Xlate("more than %1 MB come out of what is no file").arg(largestUnmapped >> 20);
        }
        if (used == size && size > 0) {
            break;
        }
        if (used == content_.size()) {
            content_.resize(size > 0 ? qsizetype(size) : std::min(std::max(firstRoom, 2 * used), largestUnmapped + 1));
        }
        count = readSome(file_.handle(), content_.data() + used, content_.size() - used);
        if (count < 0) {
            return systemReason();
        }
    }
    content_.truncate(used);
    return used < size ? std::optional(cutShort()) : std::nullopt;
}

std::optional<InputError> FileBytes::lostBytes() const
{
    // What is cut off the last page reads as zeros without a signal.
    const bool isLost = mapped_.isLost() || file_.size() < static_cast<qint64>(mapped_.view().size());
    return isLost ? std::optional(InputError{path_, std::nullopt, cutShort()}) : std::nullopt;
}

} // namespace kareport
