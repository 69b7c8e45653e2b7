#include "ByteLineReader.h"

#include <QIODevice>

#include <algorithm>
#include <cstring>

namespace kareport
{

namespace
{

constexpr qsizetype chunkSize = qsizetype(256) * 1024;

} // namespace

void ByteLineReader::fill()
{
    // A whole piece with its line end is looked at together.
    while (!atEnd_ && bytes_.size() - at_ < longestPiece + 1) {
        bytes_.remove(0, at_);
        at_ = 0;
        const qsizetype kept = bytes_.size();
        bytes_.resize(kept + chunkSize);
        const qint64 read = device_.read(bytes_.data() + kept, chunkSize);
        bytes_.resize(kept + static_cast<qsizetype>(std::max<qint64>(read, 0)));
        atEnd_ = read <= 0;
    }
}

bool ByteLineReader::next()
{
    fill();
    const qsizetype available = std::min(bytes_.size() - at_, longestPiece + 1);
    if (available == 0) {
        size_ = 0;
        taken_ = 0;
        return false;
    }
    char *const line = bytes_.data() + at_;
    const void *const feed = std::memchr(line, '\n', static_cast<std::size_t>(available));
    qsizetype content = feed != nullptr ? static_cast<const char *>(feed) - line : available;
    qsizetype taken = content;
    bool ends = false;
    if (feed != nullptr) {
        const bool hasReturn = content > 0 && line[content - 1] == '\r';
        content -= hasReturn ? 1 : 0;
        ends = content < longestPiece;
        taken = ends ? taken + 1 : content;
    }
    if (!ends) {
        // A CR whose LF may follow what was looked at belongs to the next piece.
        content = taken = std::min(content, longestPiece);
    }
    size_ = content;
    if (ends) {
        line[size_++] = '\n'; // where it was, or in place of the CR before it
    }
    taken_ = taken;
    at_ += taken;
    return true;
}

} // namespace kareport
