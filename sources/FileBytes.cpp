#include "FileBytes.h"

#include "InputHandle.h"
#include "Xlate.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <system_error>

namespace kareport
{

namespace
{

/// What is read from a pipe or a device, which may never end.
constexpr std::size_t largestUnmapped = std::size_t(1) << 30;
/// A smaller file is read: mapping it, and above all taking the mapping back on every processor, takes longer.
constexpr qint64 smallestMapped = qint64(1) << 20;
/// What a pipe is read in.
constexpr std::size_t pipeRoom = std::size_t(64) * 1024;

QString systemReason()
{
    return QString::fromStdString(std::generic_category().message(errno));
}

QString cutShort()
{
    return Xlate("the file was cut short while it was read");
}

} // namespace

Expected<std::shared_ptr<const FileBytes>> FileBytes::open(const QString &path)
{
    return ofHandle(path, openForReading(path));
}

Expected<std::shared_ptr<const FileBytes>> FileBytes::openStandardInput()
{
    return ofHandle(QStringLiteral("-"), kareport::openStandardInput());
}

/// The bytes of what was opened, which is closed after it; the handle is below 0 where it could not be opened.
Expected<std::shared_ptr<const FileBytes>> FileBytes::ofHandle(const QString &path, int handle)
{
    auto bytes = std::make_shared<FileBytes>();
    bytes->path_ = path;
    if (handle < 0) {
        return InputError{path, std::nullopt, systemReason()};
    }
    bytes->file_.open(handle, QIODevice::ReadOnly | QIODevice::Unbuffered, QFileDevice::AutoCloseHandle);
    // Of what was read in part already, as standard input may be, the rest counts.
    const qint64 size = isAtStart(handle) ? bytes->file_.size() : 0;
    if (size >= smallestMapped && bytes->mapped_.map(handle, static_cast<std::size_t>(size))) {
        bytes->view_ = bytes->mapped_.view();
        return std::shared_ptr<const FileBytes>(std::move(bytes));
    }
    if (const auto wrong = size > 0 ? bytes->read(size) : bytes->readPipe()) {
        return InputError{path, std::nullopt, *wrong};
    }
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

Expected<std::shared_ptr<const FileBytes>> FileBytes::ofSpooled(const QString &path, SpooledBytes &&spooled)
{
    auto bytes = std::make_shared<FileBytes>();
    bytes->path_ = path;
    bytes->spooled_ = std::move(spooled);
    if (!bytes->spooled_.finish()) {
        return InputError{path, std::nullopt, bytes->spooled_.wrong()};
    }
    bytes->view_ = bytes->spooled_.view();
    return std::shared_ptr<const FileBytes>(std::move(bytes));
}

/// Reads a file of a size. @return what is wrong with it
std::optional<QString> FileBytes::read(qint64 size)
{
    content_.resize(size);
    qsizetype used = 0;
    for (qint64 count = 1; count > 0 && used < size; used += std::max<qint64>(count, 0)) {
        count = readSome(file_.handle(), content_.data() + used, static_cast<std::size_t>(size - used));
        if (count < 0) {
            return systemReason();
        }
    }
    view_ = {content_.constData(), static_cast<std::size_t>(used)};
    return used < size ? std::optional(cutShort()) : std::nullopt;
}

/// Reads what has no size until its end. @return what is wrong with it
std::optional<QString> FileBytes::readPipe()
{
    std::array<char, pipeRoom> room;
    for (qint64 count = 1; count > 0;) {
        count = readSome(file_.handle(), room.data(), room.size());
        if (count < 0) {
            return systemReason();
        }
        if (!spooled_.append({room.data(), static_cast<std::size_t>(count)})) {
            return spooled_.wrong();
        }
        if (spooled_.size() > largestUnmapped) {
            return Xlate("the pipe or device gives more than %1 MB, the most that was expected")
                .arg(largestUnmapped >> 20);
        }
    }
    if (!spooled_.finish()) {
        return spooled_.wrong();
    }
    view_ = spooled_.view();
    return std::nullopt;
}

void FileBytes::releasePiece(std::size_t begin, std::size_t end) const
{
    mapped_.release(begin, end);
    spooled_.release(begin, end);
}

std::optional<InputError> FileBytes::lostBytes() const
{
    // What is cut off the last page reads as zeros without a signal.
    const bool isLost = mapped_.isLost() || file_.size() < static_cast<qint64>(mapped_.view().size());
    return isLost ? std::optional(InputError{path_, std::nullopt, cutShort()}) : std::nullopt;
}

} // namespace kareport
