#include "FileBytes.h"

#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// What is read into memory from a pipe or a device, which may never end.
constexpr qint64 largestUnmapped = qint64(1) << 30;
/// A smaller file is read: mapping it, and above all taking the mapping back on every processor, takes longer.
constexpr qint64 smallestMapped = qint64(1) << 20;

} // namespace

Expected<std::shared_ptr<const FileBytes>> FileBytes::open(const QString &path)
{
    auto bytes = std::make_shared<FileBytes>();
    bytes->path_ = path;
    bytes->file_.setFileName(path);
    if (!bytes->file_.open(QIODevice::ReadOnly)) {
        return InputError{path, std::nullopt, bytes->file_.errorString()};
    }
    const qint64 size = bytes->file_.size();
    if (const uchar *mapped = size >= smallestMapped ? bytes->file_.map(0, size) : nullptr) {
        bytes->view_ = {reinterpret_cast<const char *>(mapped), static_cast<std::size_t>(size)};
        return std::shared_ptr<const FileBytes>(std::move(bytes));
    }
    bytes->content_ = bytes->file_.read(size > 0 ? std::min(size, largestUnmapped + 1) : largestUnmapped + 1);
    if (bytes->content_.size() > largestUnmapped) {
        return InputError{path, TextPlace(),
                          Xlate("more than %1 MB come out of what is no file").arg(largestUnmapped >> 20)};
    }
    if (bytes->content_.size() < size) {
        return InputError{path, std::nullopt, Xlate("the file was cut short while it was read")};
    }
    if (bytes->file_.error() != QFileDevice::NoError) {
        return InputError{path, std::nullopt, bytes->file_.errorString()};
    }
    bytes->view_ = {bytes->content_.constData(), static_cast<std::size_t>(bytes->content_.size())};
    return std::shared_ptr<const FileBytes>(std::move(bytes));
}

} // namespace kareport
