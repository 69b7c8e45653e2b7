#include "ReportLines.h"

#include <algorithm>
#include <cstring>
#include <limits>
#include <new>

namespace kareport
{

namespace
{

/// Lines are kept in blocks of so many bytes; a longer line has a block of its own.
constexpr std::size_t blockBytes = 0x40000;

constexpr bool isOneByte(char16_t character)
{
    return character < 0x100;
}

} // namespace

ReportLines::ReportLines(QObject *parent) : QAbstractListModel(parent) {}

ReportLines::~ReportLines() = default;

char *ReportLines::room(std::size_t bytes)
{
    if (blocks_.empty() || size_ - used_ < bytes) {
        const std::size_t size = std::max(bytes, blockBytes);
        blocks_.push_back(std::make_unique_for_overwrite<char[]>(size));
        size_ = size;
        used_ = 0;
    }
    return blocks_.back().get() + used_;
}

bool ReportLines::append(QStringView line)
{
    if (count() == std::numeric_limits<int>::max() || line.size() > std::numeric_limits<int>::max()) {
        return false;
    }
    try {
        const auto *first = line.utf16();
        const bool isWide = !std::all_of(first, first + line.size(), isOneByte);
        const auto length = static_cast<std::size_t>(line.size());
        const std::size_t bytes = isWide ? 2 * length : length;
        char *place = room(bytes);
        lines_.push_back({place, static_cast<int>(length), isWide});
        if (isWide) {
            std::memcpy(place, first, bytes);
        } else {
            std::transform(first, first + length, place,
                           [](char16_t character) { return static_cast<char>(character); });
        }
        used_ += bytes;
        return true;
    } catch (const std::bad_alloc &) {
        return false;
    }
}

void ReportLines::clear()
{
    beginResetModel();
    lines_.clear();
    blocks_.clear();
    used_ = 0;
    size_ = 0;
    published_ = 0;
    endResetModel();
}

void ReportLines::publish()
{
    if (hasUnpublished()) {
        beginInsertRows(QModelIndex(), published_, count() - 1);
        published_ = count();
        endInsertRows();
    }
}

QString ReportLines::line(int number) const
{
    if (number < 0 || number >= count()) {
        return QString();
    }
    const Line &line = lines_[static_cast<std::size_t>(number)];
    if (!line.isWide) {
        return QString::fromLatin1(line.bytes, line.length);
    }
    QString text(line.length, Qt::Uninitialized);
    std::memcpy(text.data(), line.bytes, 2 * static_cast<std::size_t>(line.length)); // they may begin at an odd place
    return text;
}

int ReportLines::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : published_;
}

QVariant ReportLines::data(const QModelIndex &index, int role) const
{
    return index.isValid() && index.row() < published_ && role == Qt::DisplayRole ? QVariant(line(index.row()))
                                                                                  : QVariant();
}

} // namespace kareport
