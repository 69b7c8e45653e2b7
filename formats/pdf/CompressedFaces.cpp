#include "CompressedFaces.h"

#include <algorithm>

namespace kareport
{

CompressedFaces &CompressedFaces::ofProcess()
{
    static CompressedFaces faces;
    return faces;
}

QByteArray CompressedFaces::find(QByteArrayView face)
{
    const std::lock_guard held(lock_);
    const auto found =
        std::find_if(entries_.begin(), entries_.end(), [face](const Entry &entry) { return entry.face == face; });
    if (found == entries_.end()) {
        return {};
    }
    std::rotate(found, found + 1, entries_.end());
    return entries_.back().compressed;
}

void CompressedFaces::keep(const QByteArray &face, const QByteArray &compressed)
{
    const std::lock_guard held(lock_);
    const qint64 added = face.size() + compressed.size();
    const bool isKept =
        std::any_of(entries_.begin(), entries_.end(), [&face](const Entry &entry) { return entry.face == face; });
    if (isKept || added > mostBytes) { // another thread may have compressed it meanwhile
        return;
    }
    entries_.push_back({face, compressed});
    size_ += added;
    auto firstKept = entries_.begin();
    for (; size_ > mostBytes; ++firstKept) {
        size_ -= firstKept->size();
    }
    entries_.erase(entries_.begin(), firstKept);
}

qint64 CompressedFaces::size() const
{
    const std::lock_guard held(lock_);
    return size_;
}

} // namespace kareport
